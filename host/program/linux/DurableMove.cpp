#include "host/program/system/DurableMove.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

namespace fs = std::filesystem;

namespace {

/// What a file system answers that cannot do it: some cannot with folders.
bool MeansUnable(int error) {
    return error == EINVAL || error == EROFS;
}

std::error_code Sync(int descriptor) {
    int result = 0;
    do {
        result = fsync(descriptor);
    } while (result != 0 && errno == EINTR);
    return {result != 0 && !MeansUnable(errno) ? errno : 0, std::generic_category()};
}

/// @param flags for open
std::error_code Sync(const fs::path& path, int flags) {
    const int descriptor = open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | flags);
    if (descriptor < 0)
        return {errno, std::generic_category()};
    const std::error_code error = Sync(descriptor);
    close(descriptor);
    return error;
}

} // namespace

std::error_code SyncFile(const fs::path& file) {
    return Sync(file, 0);
}

std::error_code MoveWithoutReplacing(const fs::path& from, const fs::path& to) {
    std::error_code error = Sync(from, 0);
    if (error && error != std::errc::permission_denied) // not ours to read, nor to write out
        return error;
    if (renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return {};
    if (errno != EINVAL && errno != ENOSYS)
        return {errno, std::generic_category()};
    // The file system cannot do both at once. To link and unlink could leave both names.
    if (fs::exists(fs::symlink_status(to, error)))
        return std::make_error_code(std::errc::file_exists);
    fs::rename(from, to, error);
    return error;
}

std::error_code MoveDurably(const fs::path& from, const fs::path& to) {
    std::error_code error = Sync(from, 0);
    if (!error)
        fs::rename(from, to, error);
    return error;
}

std::error_code SyncFolder(const fs::path& folder) {
    const std::error_code error = Sync(folder, O_DIRECTORY);
    // A folder that may be written to but not be looked into cannot be opened for it.
    return error == std::errc::permission_denied ? std::error_code() : error;
}
