#include "standins/office/host/DocumentWork.h"

#include "standins/office/host/LoadedDocument.h"
#include "standins/office/shared/TextLibraryNames.h"
#include "standins/office/text/DocumentPath.h"
#include "standins/office/text/FontUse.h"
#include "standins/shared/DefaultSignals.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <vector>

namespace fs = std::filesystem;

namespace standins {

namespace {

constexpr int CannotStart = 127; // as a shell has it

/// The folders that LibreOffice has made for its temporary files in the current folder; it goes on
/// looking for them there.
std::vector<std::string> TemporaryFolders() {
    std::vector<std::string> names;
    std::error_code error;
    for (const fs::directory_entry& entry : fs::directory_iterator(".", error)) {
        const std::string name = entry.path().filename();
        if (name.compare(0, 2, "lu") == 0 && entry.is_directory(error))
            names.push_back(name);
    }
    return names;
}

bool IsFile(int descriptor) {
    struct stat status {};
    return fstat(descriptor, &status) == 0 && (S_ISREG(status.st_mode) || S_ISCHR(status.st_mode));
}

/// What is no file, pipes above all, is the parent's, too, and its other children's: no document is
/// to reach them. A child does not wait at any.
bool GiveUpShared() {
    std::vector<int> shared;
    std::error_code error;
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc/self/fd", error)) {
        const int descriptor = std::stoi(entry.path().filename());
        if (!IsFile(descriptor))
            shared.push_back(descriptor);
    }
    return !error && std::all_of(shared.begin(), shared.end(), [](int descriptor) {
        return dup3(STDIN_FILENO, descriptor, O_CLOEXEC) >= 0;
    });
}

/// @return whether the process may go on to the document
bool BecomeEngine(const HostOrder& order, const Descriptor& log, pid_t supervisor) {
    setpgid(0, 0);
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (getppid() != supervisor) // it went before it could take us along
        return false;
    prctl(PR_SET_NAME, "office-document");
    RestoreDefaultSignals();
    const std::vector<std::string> temporaryFolders = TemporaryFolders();
    if (dup2(log.Get(), STDOUT_FILENO) < 0 || dup2(log.Get(), STDERR_FILENO) < 0 ||
        !GiveUpShared() || chdir(order.folder.c_str()) != 0 ||
        setenv("HOME", order.folder.c_str(), 1) != 0)
        return false;
    for (const std::string& name : temporaryFolders) {
        if (mkdir(name.c_str(), S_IRWXU) != 0)
            return false;
    }
    return true;
}

/// Tells the log when a step is done, in seconds from the first.
void TellTime(const char* step) {
    using Clock = std::chrono::steady_clock;
    static const Clock::time_point s_start = Clock::now();
    std::fprintf(stderr, "%s: %.3f\n", step,
                 std::chrono::duration<double>(Clock::now() - s_start).count());
}

void Work(const HostOrder& order) {
    SetDocumentPath(order.openedPath.c_str(), order.document.c_str());
    StartFontUse();
    TellTime("begun");
    const LoadedDocument document(order.openedPath, order.importFilter);
    TellTime("loaded");
    if (!document.IsLoaded())
        return;
    document.Export(order.exportTo, order.output);
    TellTime("exported");
    if (order.hiddenTo.empty())
        return;
    if (document.HasHiddenSlides())
        document.Export(order.hiddenTo, order.hiddenOutput);
    else
        link(order.output.c_str(), order.hiddenOutput.c_str());
}

} // namespace

void DoWork(const HostOrder& order, const Descriptor& log, pid_t supervisor, Reach reach) {
    reach.workFolder = order.folder;
    if (!BecomeEngine(order, log, supervisor) || !Confine(reach))
        _exit(CannotStart);
    try {
        Work(order);
        WriteFontUse((order.folder + '/' + FontUseFile).c_str());
    } catch (const std::exception& error) { // out of memory, above all
        std::fprintf(stderr, "Error: %s\n", error.what());
        std::abort();
    }
    std::fflush(nullptr);
    _exit(EXIT_SUCCESS);
}

} // namespace standins
