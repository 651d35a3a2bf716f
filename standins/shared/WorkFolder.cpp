#include "standins/shared/WorkFolder.h"

#include "standins/shared/ProcessTable.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <ctime>
#include <filesystem>
#include <memory>
#include <random>
#include <string_view>

namespace fs = std::filesystem;

namespace standins {

namespace {

constexpr const char* MarkName = "in use";

/// How long a folder may be without its mark. From one to the other is a moment, unless the process
/// is stopped in between: then its run fails.
constexpr std::time_t LongestUnmarked = 3600; // seconds

/// One path for one folder, however the environment spells it: LibreOffice names its socket by it.
fs::path TemporaryFolder() {
    std::error_code error;
    const fs::path folder = fs::canonical(fs::temp_directory_path(error), error);
    return error ? fs::path("/tmp") : folder;
}

std::string NamePrefix(const std::string& kind) {
    return "quillon-" + kind + "-";
}

bool IsNumber(std::string_view text) {
    return !text.empty() && text.find_first_not_of("0123456789") == std::string_view::npos;
}

/// Whether NewPath gives such names.
bool IsName(std::string_view name, const std::string& prefix) {
    if (name.substr(0, prefix.size()) != prefix)
        return false;
    const std::string_view numbers = name.substr(prefix.size());
    const std::size_t dash = numbers.find('-');
    return dash != std::string_view::npos && IsNumber(numbers.substr(0, dash)) &&
           IsNumber(numbers.substr(dash + 1));
}

/// The mark gets its name when it is locked, so that an unlocked one is always an abandoned one.
/// Where a file system has no locks, nobody can lock it, and the folder is left alone.
/// @return closed, with errno set, when it cannot be made
Descriptor MakeMark(const std::string& folder) {
    const std::string mark = folder + "/" + MarkName;
    const std::string unlocked = mark + " soon";
    Descriptor file(
        open(unlocked.c_str(), O_RDWR | O_CREAT | O_EXCL | O_CLOEXEC, S_IRUSR | S_IWUSR));
    if (!file.IsOpen())
        return file;
    flock(file.Get(), LOCK_EX | LOCK_NB);
    return rename(unlocked.c_str(), mark.c_str()) == 0 ? std::move(file) : Descriptor();
}

/// An engine may have put something else in its place.
bool LacksMark(int folder) {
    struct stat status {};
    const int found = fstatat(folder, MarkName, &status, AT_SYMLINK_NOFOLLOW);
    return found == 0 ? !S_ISREG(status.st_mode) : errno == ENOENT;
}

/// Looks whether a folder is this user's and abandoned.
/// @param mark receives its mark, locked, if it has one
bool IsAbandoned(int folder, Descriptor& mark) {
    struct stat status {};
    if (fstat(folder, &status) != 0 || status.st_uid != geteuid())
        return false;
    if (LacksMark(folder))
        return std::time(nullptr) - status.st_mtime > LongestUnmarked;
    mark = Descriptor(openat(folder, MarkName, O_RDWR | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    return mark.IsOpen() && flock(mark.Get(), LOCK_EX | LOCK_NB) == 0;
}

struct CloseFolder {
    void operator()(DIR* folder) const { closedir(folder); }
};

/// The mark goes last: what is left when this process is killed meanwhile can still be told. Links
/// are removed and not followed, also those that are put in place meanwhile.
void Remove(const std::string& path) {
    std::error_code ignored; // nobody is left to be told
    for (fs::directory_iterator entry(path, ignored), end; !ignored && entry != end;
         entry.increment(ignored)) {
        std::error_code alsoIgnored;
        if (entry->path().filename() != MarkName)
            fs::remove_all(entry->path(), alsoIgnored);
    }
    fs::remove_all(path, ignored);
}

} // namespace

std::string WorkFolder::NewPath(const std::string& kind) {
    std::random_device random;
    const std::uint64_t number = (static_cast<std::uint64_t>(random()) << 32) | random();
    return TemporaryFolder() /
           (NamePrefix(kind) + std::to_string(getpid()) + "-" + std::to_string(number));
}

WorkFolder::WorkFolder(std::string path) : m_path(std::move(path)) {
    if (mkdir(m_path.c_str(), S_IRWXU) != 0)
        return;
    m_mark = MakeMark(m_path);
    if (!m_mark.IsOpen()) {
        const int error = errno;
        Remove(m_path);
        errno = error;
    }
}

WorkFolder::~WorkFolder() {
    if (IsMade())
        Remove(m_path);
}

std::uint64_t WorkFolder::Size() const {
    std::uint64_t sum = 0;
    std::error_code error;
    for (fs::recursive_directory_iterator entry(m_path, error), end; !error && entry != end;
         entry.increment(error)) {
        std::error_code gone; // the engine makes and removes files all the time
        const std::uintmax_t size = entry->is_regular_file(gone) ? entry->file_size(gone) : 0;
        if (!gone)
            sum += size;
    }
    return sum;
}

void WorkFolder::Discard(const std::string& path, ClearOutside clearOutside) {
    EndProcessesAtHome(path);
    if (clearOutside)
        clearOutside(path); // first: what is outside is found by the folder
    Remove(path);
}

/// Names alone are looked at, without a thing asked of the system for each: there may be very many
/// temporary files.
void WorkFolder::DiscardAbandoned(const std::string& kind, ClearOutside clearOutside) {
    const fs::path base = TemporaryFolder();
    const std::string prefix = NamePrefix(kind);
    const std::unique_ptr<DIR, CloseFolder> all(opendir(base.c_str()));
    while (const dirent* entry = all ? readdir(all.get()) : nullptr) {
        if (!IsName(entry->d_name, prefix))
            continue;
        const std::string path = base / entry->d_name;
        const Descriptor folder(
            open(path.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
        Descriptor mark;
        if (folder.IsOpen() && IsAbandoned(folder.Get(), mark))
            Discard(path, clearOutside);
    }
}

} // namespace standins
