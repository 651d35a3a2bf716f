// The supervisor of one engine run. The server of the Office applications gives it the document
// to read.

#include "standins/engine/Supervisor.h"
#include "standins/office/engine/Supervision.h"

#include <cstdlib>
#include <exception>

namespace {

int Run(int argc, char** argv) {
    standins::EngineJob job;
    standins::SupervisorOptions supervisor;
    CLI::App options("Supervises one run of LibreOffice.");
    supervisor.AddTo(options);
    options.add_option("--program", job.program)->required();
    options.add_option("--document", job.knownPath)->required();
    options.add_option("--extension", job.extension)->required();
    options.add_option("--import", job.importFilter)->required();
    options.add_option("--export", job.exportTo)->required();
    CLI11_PARSE(options, argc, argv);
    const standins::Channel server = standins::BecomeSupervisor(1, supervisor.mostMemory);
    job.folder = supervisor.folder;
    job.fontFolders = supervisor.fontFolders;
    job.limits = supervisor.Limits();
    job.mostMemory = supervisor.mostMemory;
    standins::Supervise(job, standins::FirstGivenDescriptor, server);
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
