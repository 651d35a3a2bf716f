#include "standins/office/inprocess/FilePrinter.h"

#include "standins/inprocess/Fonts.h"
#include "standins/inprocess/Paths.h"
#include "standins/office/inprocess/Call.h"
#include "standins/office/inprocess/Settings.h"
#include "standins/office/printer/ExitCode.h"
#include "standins/shared/ChildProcess.h"
#include "standins/shared/Clocks.h"
#include "standins/shared/FileBytes.h"
#include "standins/shared/NewFile.h"
#include "standins/shared/ProcessEnd.h"
#include "standins/shared/ProcessTable.h"
#include "standins/shared/Text.h"

#include <glib.h>
#include <poll.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <cerrno>

namespace standins {

namespace {

const std::string WriterName = "the PostScript writer";

[[noreturn]] void RaiseCannotWrite(const PrintRequest& request, const Failure& failure) {
    throw Raised{request.title + L" cannot be printed to " + request.output + L": " +
                     FromUtf8(failure.reason) + L".",
                 failure};
}

[[noreturn]] void RaiseCannotWrite(const PrintRequest& request, int error) {
    RaiseCannotWrite(request, {ErrorWords(error), Fault::Machine});
}

/// What the writer may take.
struct WriterLimits {
    TimeLimits times = ReadTimeLimits();
    std::uint64_t memory = ReadMemoryLimit(); ///< in bytes
};

std::vector<std::string> WriterArguments(const PrintRequest& request, const WriterLimits& limits) {
    std::vector<std::string> arguments = {
        "--title=" + ToUtf8(request.title).value_or("document"),
        "--copies=" + std::to_string(request.copies),
        "--total=" + std::to_string(limits.times.total.count()),
        "--memory=" + std::to_string(limits.memory),
        request.collate ? "--collate" : "--no-collate",
    };
    for (const std::string& folder : FontFolders())
        arguments.push_back("--fonts=" + folder);
    const std::string user = g_get_user_name();
    if (!user.empty())
        arguments.push_back("--user=" + user);
    arguments.insert(arguments.end(), request.layout.begin(), request.layout.end());
    return arguments;
}

std::uint64_t SizeOf(int file) {
    struct stat status {};
    return fstat(file, &status) == 0 ? static_cast<std::uint64_t>(status.st_size) : 0;
}

/// Waits for the writer, under the two clocks and the limit on memory.
/// @return why it must be ended; no failure when it has ended by itself
Failure AwaitWriter(const ChildProcess& writer, int output, const WriterLimits& limits) {
    Clocks clocks(limits.times);
    for (;;) {
        pollfd event{writer.ExitDescriptor(), POLLIN, 0};
        if (poll(&event, 1, static_cast<int>(clocks.Interval().count())) > 0)
            return {};
        const GroupUsage usage = UsageOfGroup(writer.Id());
        if (usage.memory > limits.memory)
            return MemoryFailure(WriterName, limits.memory);
        if (clocks.Check({usage.cpuTicks, SizeOf(output)}) != Clocks::State::Running)
            return {WriterName + " took too long"};
    }
}

/// What the writer said last: the reason, after all that its libraries had to say.
std::string LastLine(int file) {
    std::string text;
    ReadWhole(file, [&](const char* bytes, std::size_t size) {
        text.append(bytes, size);
        return 0;
    });
    text.erase(text.find_last_not_of('\n') + 1);
    return text.substr(text.rfind('\n') + 1);
}

/// Why the writer has failed, or not, once it has ended by itself.
/// @param messages what it has said
Failure DescribeWriter(int status, int messages, const MemoryShortage& shortage) {
    const std::string reason = WIFEXITED(status) && status != 0 ? LastLine(messages) : "";
    if (reason.empty())
        return DescribeEnd(WriterName, status, shortage);
    return {reason, WEXITSTATUS(status) == CannotWrite ? Fault::Machine : Fault::Document};
}

Failure WritePostScript(const PrintRequest& request, int output) {
    const WriterLimits limits;
    const MemoryShortage shortage;
    const Descriptor messages(memfd_create("messages", MFD_CLOEXEC));
    std::optional<ChildProcess> writer = ChildProcess::Start(
        HelperPath("pdf-to-ps"), WriterArguments(request, limits),
        {request.pages->file.Get(), output, messages.Get()}, Environment::Empty);
    if (!writer)
        return MachineFailure(WriterName + " cannot be started", errno);
    if (Failure failure = AwaitWriter(*writer, output, limits))
        return failure;
    return DescribeWriter(writer->Wait(), messages.Get(), shortage);
}

} // namespace

int CheckCopies(long copies) {
    constexpr long Most = 32767; // Office's own limit
    if (copies < 1 || copies > Most)
        throw Raised{L"A document cannot be printed " + std::to_wstring(copies) + L" times."};
    return static_cast<int>(copies);
}

void PrintToFile(const PrintRequest& request) {
    const std::optional<std::string> path = ToUtf8(request.output);
    if (!path || path->empty() || path->find('\0') != std::string::npos)
        RaiseCannotWrite(request, {"no file can have this name"});
    NewFile file(*path);
    if (file.Get() < 0)
        RaiseCannotWrite(request, file.Error());
    if (const Failure failure = WritePostScript(request, file.Get()))
        RaiseCannotWrite(request,
                         IsFull(file.Get()) ? NoRoomFailure("the folder of the output") : failure);
    if (const int error = file.Appear())
        RaiseCannotWrite(request, error);
}

} // namespace standins
