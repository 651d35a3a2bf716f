#include "standins/office/engine/Failure.h"

#include "standins/office/engine/EngineProcess.h"
#include "standins/process/FileBytes.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/statvfs.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstring>
#include <string_view>
#include <system_error>

namespace standins {

namespace {

constexpr std::uint64_t LittleRoom = 1 << 20; // bytes; LibreOffice needs more to do anything

bool IsFull(const std::string& folder) {
    struct statvfs room {};
    return statvfs(folder.c_str(), &room) == 0 && room.f_bavail * room.f_frsize < LittleRoom;
}

std::string DescribeFull(const std::string& folder) {
    return "there is no room left in " + folder.substr(0, folder.rfind('/'));
}

std::string DescribeSignal(int number) {
    switch (number) {
    case SIGXCPU:
        return "LibreOffice used more processor time than it may";
    case SIGXFSZ:
        return "LibreOffice wrote a larger file than it may";
    default:
        return "LibreOffice ended with signal " + std::to_string(number) + " (" +
               strsignal(number) + ")"; // NOLINT(concurrency-mt-unsafe): one thread
    }
}

} // namespace

std::string DescribeError(const std::string& what, int error) {
    return what + ": " + std::generic_category().message(error);
}

std::string DescribeStall(const TimeLimits& limits) {
    return "LibreOffice stopped responding for " + std::to_string(limits.stall.count()) +
           " seconds";
}

std::string DescribeOverdue(const TimeLimits& limits) {
    return "LibreOffice took longer than " + std::to_string(limits.total.count()) + " seconds";
}

std::string DescribeStatus(int status, const std::string& folder) {
    if (WIFEXITED(status) && WEXITSTATUS(status) == 0)
        return {};
    if (IsFull(folder))
        return DescribeFull(folder);
    if (WIFSIGNALED(status))
        return DescribeSignal(WTERMSIG(status));
    if (WEXITSTATUS(status) == EngineCannotStart)
        return "LibreOffice cannot be started";
    return "LibreOffice ended with exit code " + std::to_string(WEXITSTATUS(status));
}

std::string DescribeMissingPdf(const std::string& log, const std::string& folder) {
    if (IsFull(folder))
        return DescribeFull(folder);
    constexpr std::size_t LongEnough = std::size_t{64} << 10;
    const std::string words = ReadText(log, LongEnough);
    if (words.find("could not be loaded") != std::string::npos)
        return "LibreOffice cannot load it; the file is damaged or not of its type";
    return "LibreOffice loaded it, but made no pages of it";
}

Descriptor OpenPdf(const std::string& path) {
    constexpr std::string_view Header = "%PDF-";
    Descriptor pdf(open(path.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    struct stat status {};
    char start[Header.size()];
    if (!pdf.IsOpen() || fstat(pdf.Get(), &status) != 0 || !S_ISREG(status.st_mode) ||
        pread(pdf.Get(), start, sizeof start, 0) != static_cast<ssize_t>(sizeof start) ||
        std::string_view(start, sizeof start) != Header)
        return Descriptor();
    return pdf;
}

} // namespace standins
