// The supervisor of one engine run. The server of the Office applications starts it with the
// channel as descriptor 3 and the document as descriptor 4.

#include "standins/office/engine/Sandbox.h"
#include "standins/office/engine/Supervision.h"

#include <sys/prctl.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <csignal>
#include <cstdlib>
#include <exception>

namespace {

constexpr int ChannelDescriptor = 3;
constexpr int DocumentDescriptor = 4;

/// Whoever wants to end the supervisor ends the server: then the channel closes, and the
/// supervisor can still clear away what the engine has made.
void IgnoreSignals() {
    for (const int number : {SIGHUP, SIGINT, SIGQUIT, SIGTERM, SIGPIPE, SIGALRM})
        signal(number, SIG_IGN);
}

int Run(int argc, char** argv) {
    IgnoreSignals();
    close_range(DocumentDescriptor + 1, ~0U, 0); // whatever the host left open
    // The engine must not hold the channel: its end would not be seen when the supervisor goes.
    close_range(ChannelDescriptor, DocumentDescriptor, CLOSE_RANGE_CLOEXEC);
    prctl(PR_SET_CHILD_SUBREAPER, 1); // what the engine starts ends with it

    standins::LimitMemory();

    standins::EngineJob job;
    long stall = 0;
    long total = 0;
    CLI::App options("Supervises one run of LibreOffice.");
    options.add_option("--program", job.program)->required();
    options.add_option("--folder", job.folder)->required();
    options.add_option("--extension", job.extension)->required();
    options.add_option("--import", job.importFilter)->required();
    options.add_option("--export", job.exportFilter)->required();
    options.add_option("--stall", stall)->required();
    options.add_option("--total", total)->required();
    CLI11_PARSE(options, argc, argv);
    job.limits = {std::chrono::seconds(stall), std::chrono::seconds(total)};

    const standins::Channel server{standins::Descriptor(ChannelDescriptor)};
    standins::Supervise(job, DocumentDescriptor, server);
    return EXIT_SUCCESS;
}

} // namespace

int main(int argc, char** argv) {
    try {
        return Run(argc, argv);
    } catch (const std::exception&) { // the server sees the channel close
        return EXIT_FAILURE;
    }
}
