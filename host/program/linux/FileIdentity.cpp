#include "host/program/system/FileIdentity.h"

#include <sys/stat.h>

#include <cerrno>

namespace fs = std::filesystem;

namespace {

std::int64_t Nanoseconds(const timespec& time) {
    return static_cast<std::int64_t>(time.tv_sec) * 1'000'000'000 + time.tv_nsec;
}

fs::file_type Type(mode_t mode) {
    switch (mode & S_IFMT) {
    case S_IFREG:
        return fs::file_type::regular;
    case S_IFDIR:
        return fs::file_type::directory;
    case S_IFLNK:
        return fs::file_type::symlink;
    case S_IFIFO:
        return fs::file_type::fifo;
    case S_IFSOCK:
        return fs::file_type::socket;
    case S_IFBLK:
        return fs::file_type::block;
    case S_IFCHR:
        return fs::file_type::character;
    default:
        return fs::file_type::unknown;
    }
}

} // namespace

FileLook LookAt(const fs::path& path, std::error_code& error) {
    struct stat found = {};
    if (lstat(path.c_str(), &found) != 0) {
        error.assign(errno, std::generic_category());
        return {};
    }
    error.clear();

    FileLook look;
    look.identity.device = found.st_dev;
    look.identity.number = found.st_ino;
    look.identity.size = static_cast<std::uint64_t>(found.st_size);
    look.identity.modified = Nanoseconds(found.st_mtim);
    look.changed = Nanoseconds(found.st_ctim);
    look.type = Type(found.st_mode);
    return look;
}
