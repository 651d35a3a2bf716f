#include "standins/distiller/supervisor/GhostscriptCommand.h"

#include "standins/distiller/supervisor/FontNames.h"

#include <filesystem>

namespace standins {

namespace {

/// Ghostscript gets its files as descriptors. SAFER lets a PostScript program touch the files of
/// the command line, its fonts and its folder for temporary files: so it has no way to any file by
/// name, and no file's name can be taken for an option.
std::string FileName(int descriptor) {
    return "/dev/fd/" + std::to_string(descriptor);
}

enum EngineDescriptor { Input, Output, Errors, PostScript, Pdf, Profile };

std::vector<std::string> Words(const DistillerJob& job) {
    std::vector<std::string> words = {
        job.program, "-q", "-dBATCH", "-dNOPAUSE", "-dSAFER", "-sDEVICE=pdfwrite",
    };
    words.push_back("-sOutputFile=" + FileName(Pdf));
    std::string preparation = KeepFontsApart;
    if (job.profile >= 0) {
        words.push_back(FileName(Profile));
        preparation += std::string("(") + ProfileIsRead + "\\n) print flush";
    }
    words.insert(words.end(), {"-c", preparation, "-f"});
    words.push_back(FileName(PostScript));
    return words;
}

/// The program itself, what it brings along, and the files it is handed.
Reach GhostscriptReach(const WorkFolder& folder, const DistillerJob& job) {
    const std::filesystem::path prefix =
        std::filesystem::path(job.program).parent_path().parent_path();
    Reach reach;
    reach.readable = {job.program, prefix / "lib", prefix / "share", "/etc/ghostscript",
                      "/var/lib/ghostscript"};
    AllowSystem(reach);
    AllowFonts(reach, job.fontFolders);
    reach.workFolder = folder.Path();
    reach.files = {PostScript, Pdf};
    if (job.profile >= 0)
        reach.files.push_back(Profile);
    return reach;
}

} // namespace

EngineCommand GhostscriptCommand(const WorkFolder& folder, const DistillerJob& job, int input,
                                 int log) {
    EngineCommand command;
    command.words = Words(job);
    command.environment = EngineEnvironment(folder.Path());
    command.folder = folder.Path();
    command.descriptors = {input, log, log, job.postScript, job.pdf};
    if (job.profile >= 0)
        command.descriptors.push_back(job.profile);
    command.times = job.limits;
    command.resources.memory = job.mostMemory;
    command.reach = GhostscriptReach(folder, job);
    return command;
}

} // namespace standins
