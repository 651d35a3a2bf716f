#include "standins/office/supervisor/LibreOfficeCommand.h"

#include "standins/office/shared/OfficeReach.h"
#include "standins/office/shared/TextLibraryNames.h"
#include "standins/office/shared/UserInstallation.h"
#include "standins/office/supervisor/TextLibrary.h"

#include <glib.h>

#include <filesystem>
#include <memory>

namespace fs = std::filesystem;

namespace standins {

namespace {

/// The path by which LibreOffice opens the document: fields and headers print it.
std::string OpenedPath(const WorkFolder& folder, const EngineJob& job) {
    return job.knownPath.empty() || !FindsCopies(job.program) ? DocumentPath(folder, job)
                                                              : job.knownPath;
}

std::string UrlOf(const std::string& path) {
    const std::unique_ptr<char, decltype(&g_free)> url(
        g_filename_to_uri(path.c_str(), nullptr, nullptr), g_free);
    return url ? url.get() : path;
}

std::vector<std::string> Words(const WorkFolder& folder, const EngineJob& job) {
    const std::string installation = UserInstallationUrl(folder.Path());
    return {
        job.program + "/soffice.bin",
        "--headless",
        "--norestore",
        "--nologo",
        "--nodefault",
        "--nolockcheck",
        "-env:UserInstallation=" + installation,
        // It would write a stamp into its own program folder.
        "-env:UNO_SHARED_PACKAGES_CACHE=" + installation + "/shared",
        "--infilter=" + job.importFilter,
        "--convert-to",
        job.exportTo,
        "--outdir",
        folder.Path(),
        UrlOf(OpenedPath(folder, job)),
    };
}

Reach LibreOfficeReach(const WorkFolder& folder, const EngineJob& job) {
    Reach reach = OfficeReach(job.program, job.fontFolders);
    reach.readable.push_back(TextLibraryPath());
    reach.workFolder = folder.Path();
    reach.socketFolders = SocketFolders();
    return reach;
}

/// A name that no document has.
constexpr const char* HiddenOutputName = "profile/hidden.pdf";

} // namespace

std::string DocumentPath(const WorkFolder& folder, const EngineJob& job) {
    return folder.Path() + "/document." + job.extension;
}

std::string OutputPath(const WorkFolder& folder, const EngineJob& job) {
    const std::string stem = fs::path(OpenedPath(folder, job)).stem();
    return folder.Path() + '/' + stem + '.' + job.exportTo.substr(0, job.exportTo.find(':'));
}

std::string HiddenOutputPath(const WorkFolder& folder) {
    return folder.Path() + "/" + HiddenOutputName;
}

std::string LogPath(const WorkFolder& folder) {
    return folder.Path() + "/engine.log";
}

EngineCommand LibreOfficeCommand(const WorkFolder& folder, const EngineJob& job, int input,
                                 int log) {
    EngineCommand command;
    command.words = Words(folder, job);
    command.environment = EngineEnvironment(folder.Path());
    command.environment.emplace_back("SAL_USE_VCLPLUGIN=svp");
    command.environment.push_back(std::string("LD_PRELOAD=") + TextLibraryLink);
    command.environment.push_back(std::string(KnownPathVariable) + '=' + job.knownPath);
    command.environment.push_back(std::string(CopyVariable) + '=' + DocumentPath(folder, job));
    command.folder = folder.Path();
    command.descriptors = {input, log, log};
    command.times = job.limits;
    command.resources.memory = job.mostMemory;
    command.reach = LibreOfficeReach(folder, job);
    return command;
}

HostOrder OrderFor(const WorkFolder& folder, const EngineJob& job) {
    return {folder.Path(),
            DocumentPath(folder, job),
            OpenedPath(folder, job),
            job.importFilter,
            job.exportTo,
            OutputPath(folder, job),
            job.hiddenTo,
            HiddenOutputPath(folder)};
}

} // namespace standins
