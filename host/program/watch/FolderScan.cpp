#include "host/program/watch/FolderScan.h"

#include "host/program/base/PathText.h"
#include "host/program/system/FileSystemKind.h"
#include "host/program/watch/IgnoredNames.h"

#include <algorithm>
#include <vector>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

/// A file without anything in it is mostly one that somebody is about to write to.
constexpr std::chrono::milliseconds SettleWhenEmpty = 60s;

constexpr int DeepestFolder = 16;

/// Between calls of onProgress, in files.
constexpr std::size_t Often = 1000;

bool IsPutAwayFolder(const std::string& name) {
    return name == ProcessedFolder || name == FailedFolder;
}

/// The first part of a path such as "a/b".
wxString TopOf(const wxString& inside) {
    return inside.BeforeFirst('/');
}

} // namespace

ScanResult FolderScan::Scan(Clock::time_point now) {
    ++m_scans;
    m_now = now;
    m_error.clear();
    ScanFolder(m_rules.folder, {}, 0);
    ScanResult result;
    result.error = m_error;
    if (m_error) // what cannot be seen is not gone
        return result;
    std::set<wxString> unsettled; // folders inside with a file that settles yet
    for (auto entry = m_files.begin(); entry != m_files.end();) {
        auto& [path, file] = *entry;
        if (file.seen != m_scans) {
            entry = m_files.erase(entry);
            continue;
        }
        if (!file.told && !Settles(path, file, result)) {
            ++result.settling;
            unsettled.insert(TopOf(file.inside));
        }
        ++entry;
    }
    for (auto& [path, file] : m_files) {
        const bool waits =
            m_rules.folderIsJob && !file.inside.empty() && unsettled.count(TopOf(file.inside)) != 0;
        if (!file.hasSettled || file.told || waits)
            continue;
        file.told = true;
        result.settled.push_back({path, file.inside, file.look.identity, {}});
    }
    return result;
}

void FolderScan::ScanFolder(const fs::path& folder, const wxString& inside, int depth) {
    if (m_rules.onFolder)
        m_rules.onFolder(folder);
    std::set<std::string> names;
    std::vector<fs::path> folders;
    std::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        std::error_code unknown;
        if (entry->symlink_status(unknown).type() == fs::file_type::directory)
            folders.push_back(entry->path());
        else
            names.insert(entry->path().filename().u8string());
        if (names.size() % Often == 0 && m_rules.onProgress)
            m_rules.onProgress();
    }
    if (error) { // one inside may be gone by now, or be nobody's business
        if (depth == 0 || (error != std::errc::no_such_file_or_directory &&
                           error != std::errc::permission_denied))
            m_error = error;
        return;
    }
    for (const std::string& name : names)
        if (!IsIgnored(name) && IsTaken(name))
            See(folder / fs::u8path(name), inside, names);
    for (const fs::path& path : folders) {
        const std::string name = path.filename().u8string();
        const bool isOwn = depth == 0 && IsPutAwayFolder(name);
        if (!isOwn && !IsIgnored(name) && depth < DeepestFolder && IsText(path))
            ScanFolder(path,
                       inside.empty() ? ToText(path.filename())
                                      : inside + '/' + ToText(path.filename()),
                       depth + 1);
    }
}

/// Whether the name's extension is one of those wanted; bytes that are no text do not matter.
bool FolderScan::IsTaken(const std::string& name) const {
    if (m_rules.takesOthers)
        return true;
    const std::size_t dot = name.rfind('.');
    if (dot == std::string::npos)
        return false;
    std::string extension = name.substr(dot + 1);
    std::transform(extension.begin(), extension.end(), extension.begin(), [](unsigned char c) {
        return static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
    });
    return m_rules.extensions.count(extension) != 0;
}

/// Notes how a file is now. One that its application has open is not seen.
/// @param names all in its folder
void FolderScan::See(const fs::path& path, const wxString& inside,
                     const std::set<std::string>& names) {
    std::error_code error;
    const FileLook look = LookAt(path, error);
    if (error && error != std::errc::no_such_file_or_directory)
        m_error = error;
    if (error || look.type != fs::file_type::regular)
        return;
    const auto [entry, isNew] = m_files.try_emplace(path);
    File& file = entry->second;
    const bool isSame =
        !isNew && file.look.identity == look.identity && file.look.changed == look.changed;
    if (!isSame || IsOpenIn(path.filename().u8string(), names)) {
        file = File();
        file.since = m_now;
    }
    file.look = look;
    file.inside = inside;
    file.seen = m_scans;
}

/// @param result told when it is worth looking again
bool FolderScan::Settles(const fs::path& path, File& file, ScanResult& result) const {
    const std::chrono::milliseconds needed =
        file.look.identity.size == 0 ? std::max(m_rules.settle, SettleWhenEmpty) : m_rules.settle;
    const auto passed = std::chrono::duration_cast<std::chrono::milliseconds>(m_now - file.since);
    file.hasSettled = passed >= needed && m_now > file.since &&
                      (!m_rules.asksForWriters || AskForWriters(path) != Writers::Some);
    if (!file.hasSettled) {
        const auto rest = passed >= needed ? needed : needed - passed; // somebody writes: once more
        result.next = result.next ? std::min(*result.next, rest) : rest;
    }
    return file.hasSettled;
}
