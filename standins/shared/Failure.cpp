#include "standins/shared/Failure.h"

#include <sys/statvfs.h>

#include <cerrno>
#include <cstdint>
#include <system_error>

namespace standins {

namespace {

/// Some file systems count their files, too, and answer 0 for both when they do not.
bool HasLittleRoom(const struct statvfs& room) {
    constexpr std::uint64_t LittleRoom = 1 << 20; // bytes; engines need more to do anything
    constexpr fsfilcnt_t FewFiles = 32;
    return room.f_bavail * room.f_frsize < LittleRoom ||
           (room.f_files > 0 && room.f_favail < FewFiles);
}

} // namespace

std::string ErrorWords(int error) {
    switch (error) {
    case EAGAIN:
        return "the limit on processes is reached (ulimit -u)";
    case EMFILE:
        return "the limit on open files is reached (ulimit -n)";
    case EFBIG:
        return "the limit on the size of a file is reached (ulimit -f)";
    default:
        return std::generic_category().message(error);
    }
}

Failure MachineFailure(const std::string& what, int error) {
    return {what + ": " + ErrorWords(error), Fault::Machine};
}

bool IsFull(int file) {
    struct statvfs room {};
    return fstatvfs(file, &room) == 0 && HasLittleRoom(room);
}

bool IsFull(const std::string& path) {
    struct statvfs room {};
    return statvfs(path.c_str(), &room) == 0 && HasLittleRoom(room);
}

Failure NoRoomFailure(const std::string& where) {
    return {"there is no room left in " + where, Fault::Machine};
}

} // namespace standins
