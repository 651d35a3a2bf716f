#pragma once

#include "host/program/system/FileIdentity.h"
#include "host/program/watch/FolderConfiguration.h"

#include <functional>
#include <map>
#include <set>

/// A file that nobody writes to any more.
struct SettledFile {
    std::filesystem::path path;
    wxString
        inside; ///< the folder inside the watched one, with '/'; empty when it lies directly there
    FileIdentity identity;
    std::string digest{}; ///< where other machines are to know it; see Job
};

/// What one scan came to.
struct ScanResult {
    std::error_code error;            ///< why the folder could not be seen
    std::vector<SettledFile> settled; ///< since the last scan
    std::size_t settling = 0;
    std::optional<std::chrono::milliseconds> next; ///< when another scan finds more settled
};

/// Finds the documents in a folder and the folders in it. Only scans tell what is there; a file has
/// settled when two of them, far enough apart, saw it the same, and nobody has it open for writing.
/// A file is told once, and again when it has become another or was away.
class FolderScan {
public:
    using Clock = std::chrono::steady_clock;

    struct Rules {
        std::filesystem::path folder;
        std::chrono::milliseconds settle;
        bool asksForWriters = true; ///< where the system can tell
        bool folderIsJob = false;
        bool takesOthers = false;         ///< files with any extension
        std::set<std::string> extensions; ///< in lower case, without dots
        std::function<void(const std::filesystem::path& folder)>
            onFolder;                     ///< called with each folder seen
        std::function<void()> onProgress; ///< called now and then, as a scan may take long
    };

    explicit FolderScan(Rules rules) : m_rules(std::move(rules)) {}

    ScanResult Scan(Clock::time_point now);

    /// Has all that is there told again.
    void Forget() { m_files.clear(); }

private:
    struct File {
        FileLook look;
        wxString inside;
        Clock::time_point since; ///< it has been as it is
        bool told = false;
        bool hasSettled = false;
        std::size_t seen = 0; ///< the number of the last scan that saw it
    };

    void ScanFolder(const std::filesystem::path& folder, const wxString& inside, int depth);
    void See(const std::filesystem::path& path, const wxString& inside,
             const std::set<std::string>& names);
    bool IsTaken(const std::string& name) const;
    bool Settles(const std::filesystem::path& path, File& file, ScanResult& result) const;

    const Rules m_rules;
    std::map<std::filesystem::path, File> m_files;
    std::size_t m_scans = 0;
    Clock::time_point m_now;
    std::error_code m_error;
};

/// The names of the folders in a watched folder that sources are put away to.
constexpr const char* ProcessedFolder = "processed";
constexpr const char* FailedFolder = "failed";
