#pragma once

#include <atomic>
#include <cstdint>
#include <filesystem>
#include <string_view>

/// A file that many threads and processes write to at once: each line of theirs arrives whole, at
/// the file's end at that moment.
class AppendFile {
public:
    AppendFile() = default;
    ~AppendFile();
    AppendFile(const AppendFile&) = delete;
    AppendFile& operator=(const AppendFile&) = delete;

    /// Opens or creates the file, in place of the one before.
    /// @return whether it is open; if not, the one before stays
    bool Open(const std::filesystem::path& path);

    bool IsOpen() const { return m_file != None; }

    /// Does nothing when no file is open. A line that cannot be written is lost: there is nowhere
    /// left to say so.
    void Append(std::string_view line) const;

    /// The same for the process's stderr; on a terminal the line takes the place of an unfinished
    /// one, such as a progress bar.
    static void AppendToStandardError(std::string_view line);

private:
    static constexpr std::intptr_t None = -1;

    std::atomic<std::intptr_t> m_file{None}; ///< the system's descriptor or handle
};
