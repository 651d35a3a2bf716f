#include "standins/office/engine/Supervision.h"

#include "standins/office/engine/DocumentCopy.h"
#include "standins/office/engine/EngineProcess.h"
#include "standins/office/engine/Failure.h"
#include "standins/office/engine/PackageKind.h"
#include "standins/office/engine/Profile.h"
#include "standins/process/ProcessTable.h"
#include "standins/process/WorkFolder.h"

#include <poll.h>
#include <sys/wait.h>

#include <array>
#include <cerrno>
#include <string>

namespace standins {

namespace {

constexpr int WantsRestart = 81; // LibreOffice's exit code after it has set up its profile

Message Failure(std::string reason) {
    return Message{MessageKind::Failed, std::move(reason), Descriptor()};
}

/// Waits for the engine, under the clocks.
/// @return the end of the watch: an empty text when the engine has ended by itself, else why it
/// must be ended
std::string Watch(const EngineProcess& engine, const WorkFolder& folder, Clocks& clocks,
                  const TimeLimits& limits, const Channel& server, Heartbeat& heartbeat) {
    for (;;) {
        std::array<pollfd, 2> events{
            {{engine.ExitDescriptor(), POLLIN, 0}, {server.Socket(), POLLIN, 0}}};
        const int ready =
            poll(events.data(), events.size(), static_cast<int>(clocks.Interval().count()));
        if (ready < 0 && errno != EINTR)
            return DescribeError("LibreOffice cannot be watched", errno);
        if (events[1].revents != 0)
            return "the application that opened it has gone";
        if (events[0].revents != 0)
            return {};
        switch (clocks.Check({CpuTicksOfGroup(engine.Group()), folder.Size()})) {
        case Clocks::State::Running:
            heartbeat.Beat();
            break;
        case Clocks::State::Stalled:
            return DescribeStall(limits);
        case Clocks::State::Overdue:
            return DescribeOverdue(limits);
        }
    }
}

/// Runs LibreOffice until it has ended, once more if it asks for it.
/// @return why it failed; empty when it ended well
std::string RunEngine(const EngineJob& job, const WorkFolder& folder, const Channel& server,
                      Heartbeat& heartbeat) {
    Clocks clocks(job.limits);
    int status = 0;
    for (int start = 0; start < 2; ++start) {
        EngineProcess engine(folder, job);
        if (!engine.IsStarted())
            return DescribeError("LibreOffice cannot be started", errno);
        std::string ended = Watch(engine, folder, clocks, job.limits, server, heartbeat);
        status = engine.End();
        if (!ended.empty())
            return ended;
        if (!WIFEXITED(status) || WEXITSTATUS(status) != WantsRestart)
            break;
    }
    return DescribeStatus(status, folder.Path());
}

/// Everything that happens in the work folder; it is gone afterwards.
Message ConvertInFolder(const EngineJob& job, int document, const Channel& server) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return Failure(DescribeError("the folder " + job.folder + " cannot be made", errno));
    Heartbeat heartbeat(server);
    const DocumentCopy copy = CopyDocument(document, DocumentPath(folder, job), heartbeat);
    if (copy.error != 0)
        return Failure(DescribeError("it cannot be copied to " + job.folder, copy.error));
    if (IsPackageOfAnotherKind(DocumentPath(folder, job), job.extension))
        return Failure("it is a document of another application");
    if (!MakeProfile(folder.Path(), job.program))
        return Failure(DescribeError("LibreOffice's profile cannot be written", errno));
    std::string failure = RunEngine(job, folder, server, heartbeat);
    if (!failure.empty())
        return Failure(std::move(failure));
    Descriptor pdf = OpenPdf(PdfPath(folder));
    if (!pdf.IsOpen())
        return Failure(DescribeMissingPdf(LogPath(folder), folder.Path()));
    return Message{MessageKind::Done, copy.sha256, std::move(pdf)};
}

} // namespace

void Supervise(const EngineJob& job, int document, const Channel& server) {
    const Message result = ConvertInFolder(job, document, server);
    server.Send(result.kind, result.text, result.attachment.Get());
}

} // namespace standins
