// Prints what the engine made of a document, its standard input: PostScript on standard output. In
// a process of its own, since the document is one that anybody may have made. What goes wrong is
// one line on standard error, and exit code 1 or CannotWrite.

#include "standins/confinement/Confinement.h"
#include "standins/confinement/ResourceLimits.h"
#include "standins/office/printer/ExitCode.h"
#include "standins/office/printer/PostScriptWriter.h"

#include <sys/prctl.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <map>
#include <sstream>
#include <string>

#ifdef __SANITIZE_ADDRESS__
/// LeakSanitizer looks at a process from another one, which there cannot be here.
extern "C" int __lsan_is_turned_off();
extern "C" int __lsan_is_turned_off() {
    return 1;
}
#endif

namespace {

constexpr std::uint64_t LargestFile = std::uint64_t{4} << 30;

/// Fonts, and what tells of characters, the C library's tables of them included, of the ends of
/// words, and of the time.
standins::Reach WriterReach(const std::vector<std::string>& fontFolders) {
    standins::Reach reach;
    reach.readable = {"/usr/lib", "/usr/share/poppler", "/usr/share/libthai", "/etc/localtime",
                      "/usr/share/zoneinfo"};
    AllowFonts(reach, fontFolders);
    return reach;
}

/// @throws CLI::ValidationError
standins::PrinterPaper ReadPaper(const std::string& text) {
    standins::PrinterPaper paper;
    std::istringstream numbers(text);
    char comma = ',';
    for (double* const value :
         {&paper.width, &paper.height, &paper.left, &paper.bottom, &paper.right, &paper.top})
        if (comma != ',' || !(numbers >> *value) || *value < 0)
            throw CLI::ValidationError("--paper", text);
        else
            numbers >> comma;
    return paper;
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
    options
        .add_option_function<std::vector<std::string>>(
            "--paper",
            [&job](const std::vector<std::string>& papers) {
                for (const std::string& paper : papers)
                    job.papers.push_back(ReadPaper(paper));
            },
            "what the printer has: width, height, and white at the left, bottom, right and top")
        ->allow_extra_args(false);
    options.add_flag("--only-these-papers", job.onlyThesePapers, "not any other size too")
        ->needs("--paper");
    options.add_option("--colours", job.colours, "all, gray or black")
        ->transform(CLI::CheckedTransformer(std::map<std::string, Colours>{
            {"all", Colours::All}, {"gray", Colours::Gray}, {"black", Colours::BlackAndWhite}}));
}

int Run(int argc, char** argv) {
    signal(SIGPIPE, SIG_IGN);               // a failing write says so
    signal(SIGXFSZ, SIG_IGN);               // likewise
    prctl(PR_SET_PDEATHSIG, SIGKILL);       // nobody waits for the pages any more
    close_range(STDERR_FILENO + 1, ~0U, 0); // whatever the host left open

    standins::PrintJob job;
    std::vector<std::string> fontFolders;
    long totalSeconds = 0;
    standins::ResourceLimits limits;
    limits.largestFile = LargestFile;
    CLI::App options("Prints a PDF as PostScript, from standard input to standard output.");
    AddOptions(options, job);
    options.add_option("--fonts", fontFolders, "a folder of fonts")->allow_extra_args(false);
    options.add_option("--total", totalSeconds, "how long it may take, in seconds")->required();
    options.add_option("--memory", limits.memory, "how much, in bytes")->required();
    CLI11_PARSE(options, argc, argv);

    standins::PostScriptOutput output(STDOUT_FILENO, job);
    const std::chrono::seconds total(totalSeconds);
    standins::LimitResources(limits, {total, total});
    if (!standins::Confine(WriterReach(fontFolders))) {
        std::fputs("the PostScript writer cannot be kept from the rest of the machine\n", stderr);
        return standins::CannotWrite;
    }
    const standins::Failure failure = standins::WritePostScript(STDIN_FILENO, output, job);
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
