#include "standins/engine/EngineFailure.h"

#include "standins/engine/EngineProcess.h"

#include <sys/statvfs.h>
#include <sys/wait.h>

#include <csignal>
#include <cstring>
#include <system_error>

namespace standins {

namespace {

bool HasLittleRoom(const struct statvfs& room) {
    constexpr std::uint64_t LittleRoom = 1 << 20; // bytes; engines need more to do anything
    return room.f_bavail * room.f_frsize < LittleRoom;
}

std::string DescribeSignal(const std::string& engine, int number) {
    switch (number) {
    case SIGXCPU:
        return engine + " used more processor time than it may";
    case SIGXFSZ:
        return engine + " wrote a larger file than it may";
    default:
        return engine + " ended with signal " + std::to_string(number) + " (" + strsignal(number) +
               ")"; // NOLINT(concurrency-mt-unsafe): one thread
    }
}

} // namespace

std::string DescribeError(const std::string& what, int error) {
    return what + ": " + std::generic_category().message(error);
}

std::string DescribeStall(const std::string& engine, const TimeLimits& limits) {
    return engine + " stopped responding for " + std::to_string(limits.stall.count()) + " seconds";
}

std::string DescribeOverdue(const std::string& engine, const TimeLimits& limits) {
    return engine + " took longer than " + std::to_string(limits.total.count()) + " seconds";
}

std::string DescribeStatus(const std::string& engine, int status) {
    if (WIFSIGNALED(status))
        return DescribeSignal(engine, WTERMSIG(status));
    switch (WEXITSTATUS(status)) {
    case 0:
        return {};
    case EngineCannotStart:
        return engine + " cannot be started";
    default:
        return engine + " ended with exit code " + std::to_string(WEXITSTATUS(status));
    }
}

bool IsFull(int file) {
    struct statvfs room {};
    return fstatvfs(file, &room) == 0 && HasLittleRoom(room);
}

bool IsFull(const std::string& path) {
    struct statvfs room {};
    return statvfs(path.c_str(), &room) == 0 && HasLittleRoom(room);
}

std::string DescribeFull(const std::string& folder) {
    return "there is no room left in " + folder;
}

} // namespace standins
