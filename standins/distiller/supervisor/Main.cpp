// The supervisor of one run of Ghostscript. The bridge gives it the PostScript file to read, the
// PDF file to write and, if there is one, the profile to read.

#include "standins/distiller/supervisor/GhostscriptCommand.h"
#include "standins/distiller/supervisor/Supervision.h"
#include "standins/supervisor/Supervisor.h"

#include <cstdlib>
#include <exception>

namespace {

int Run(int argc, char** argv) {
    standins::DistillerJob job;
    standins::SupervisorOptions supervisor;
    bool hasProfile = false;
    CLI::App options("Supervises one run of Ghostscript.");
    supervisor.AddTo(options);
    options.add_option("--program", job.program)->required();
    options.add_flag("--profile", hasProfile, "it gets a profile, too");
    CLI11_PARSE(options, argc, argv);
    const standins::Channel bridge =
        standins::BecomeSupervisor(hasProfile ? 3 : 2, supervisor.mostMemory);
    job.folder = supervisor.folder;
    job.fontFolders = supervisor.fontFolders;
    job.limits = supervisor.Limits();
    job.mostMemory = supervisor.mostMemory;
    job.postScript = standins::FirstGivenDescriptor;
    job.pdf = standins::FirstGivenDescriptor + 1;
    if (hasProfile)
        job.profile = standins::FirstGivenDescriptor + 2;
    standins::Supervise(job, bridge);
    return EXIT_SUCCESS;
}

} // namespace

int main(int argc, char** argv) {
    try {
        return Run(argc, argv);
    } catch (const std::exception&) { // the bridge sees the channel close
        return EXIT_FAILURE;
    }
}
