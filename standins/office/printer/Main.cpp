// Prints what the engine made of a document, its standard input: PostScript on standard output. In
// a process of its own, since the document is one that anybody may have made. What goes wrong is
// one line on standard error, and exit code 1 or CannotWrite.

#include "standins/office/printer/ExitCode.h"
#include "standins/office/printer/PostScriptWriter.h"

#include <sys/prctl.h>
#include <sys/resource.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <map>
#include <string>

namespace {

/// Memory for one page at a time is needed, whatever the document asks for.
void LimitResources() {
#ifndef __SANITIZE_ADDRESS__ // whose shadow memory takes terabytes of address space
    constexpr rlim_t MostMemory = rlim_t{4} << 30;
    const rlimit memory{MostMemory, MostMemory};
    setrlimit(RLIMIT_AS, &memory);
#endif
    const rlimit none{0, 0};
    setrlimit(RLIMIT_CORE, &none);
}

void AddOptions(CLI::App& options, standins::PrintJob& job) {
    using standins::Colours;
    using standins::Contents;
    options.add_option("--title", job.title, "the document's name");
    options.add_option("--user", job.user, "for whom it is printed");
    options.add_option("--copies", job.copies, "how often")->check(CLI::Range(1, 32767));
    options.add_flag("--collate,!--no-collate", job.collate, "whole copies, one after the other");
    options
        .add_option_function<int>(
            "--handout",
            [&job](int slides) {
                job.contents = Contents::Handouts;
                job.slidesPerSheet = slides;
            },
            "so many pages a sheet")
        ->check(CLI::IsMember({1, 2, 3, 4, 6, 9}));
    options.add_flag("--down-first", job.downFirst, "handouts go down first, then across");
    options.add_flag_callback(
        "--outline", [&job] { job.contents = Contents::Outline; },
        "the input is a presentation in OpenDocument, of which the outline is printed");
    options.add_flag("--hidden", job.printHidden, "hidden slides too, in an outline");
    options.add_flag("--fit", job.fitToPaper, "scale pages to the paper");
    options.add_flag("--frames", job.frames, "a frame around each page");
    options.add_flag("--comments", job.comments, "comments too");
    options.add_option("--colours", job.colours, "all, gray or black")
        ->transform(CLI::CheckedTransformer(std::map<std::string, Colours>{
            {"all", Colours::All}, {"gray", Colours::Gray}, {"black", Colours::BlackAndWhite}}));
}

int Run(int argc, char** argv) {
    signal(SIGPIPE, SIG_IGN);               // a failing write says so
    signal(SIGXFSZ, SIG_IGN);               // likewise
    prctl(PR_SET_PDEATHSIG, SIGKILL);       // nobody waits for the pages any more
    close_range(STDERR_FILENO + 1, ~0U, 0); // whatever the host left open
    LimitResources();

    standins::PrintJob job;
    CLI::App options("Prints a PDF as PostScript, from standard input to standard output.");
    AddOptions(options, job);
    CLI11_PARSE(options, argc, argv);

    const standins::Failure failure = standins::WritePostScript(STDIN_FILENO, STDOUT_FILENO, job);
    if (!failure)
        return EXIT_SUCCESS;
    std::fprintf(stderr, "%s\n", failure.reason.c_str());
    return failure.fault == standins::Fault::Machine ? standins::CannotWrite : EXIT_FAILURE;
}

} // namespace

int main(int argc, char** argv) {
    try {
        return Run(argc, argv);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s\n", error.what());
        return EXIT_FAILURE;
    }
}
