#include "standins/office/engine/EngineProcess.h"

#include "standins/office/engine/Sandbox.h"
#include "standins/process/ChildProcess.h"
#include "standins/process/ProcessTable.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <vector>

namespace standins {

namespace {

std::vector<std::string> Arguments(const WorkFolder& folder, const EngineJob& job) {
    return {
        job.program + "/soffice.bin",
        "--headless",
        "--norestore",
        "--nologo",
        "--nodefault",
        "--nolockcheck",
        "-env:UserInstallation=" + folder.ProfileUrl(),
        // As root it would write a stamp into its own program folder.
        "-env:UNO_SHARED_PACKAGES_CACHE=" + folder.ProfileUrl() + "/shared",
        "--infilter=" + job.importFilter,
        "--convert-to",
        "pdf:" + job.exportFilter,
        "--outdir",
        folder.Path() + "/out",
        DocumentPath(folder, job),
    };
}

std::vector<std::string> Environment(const WorkFolder& folder) {
    std::vector<std::string> environment = {
        "HOME=" + folder.Path(),
        "TMPDIR=" + folder.Path(),
        // There is no program that it needs; it would ask gpg for its version for each document.
        "PATH=/nonexistent",
        "LC_ALL=C.UTF-8",
        "SAL_USE_VCLPLUGIN=svp",
    };
    if (const char* zone = std::getenv("TZ")) // dates in documents are those of the user
        environment.push_back(std::string("TZ=") + zone);
    return environment;
}

void DefaultSignals() {
    for (int number = 1; number < SIGRTMAX; ++number)
        signal(number, SIG_DFL);
    sigset_t none;
    sigemptyset(&none);
    sigprocmask(SIG_SETMASK, &none, nullptr);
}

void RedirectOutput(const WorkFolder& folder) {
    const int nothing = open("/dev/null", O_RDONLY | O_CLOEXEC);
    const int log =
        open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, S_IRUSR | S_IWUSR);
    dup2(nothing, STDIN_FILENO);
    dup2(log, STDOUT_FILENO);
    dup2(log, STDERR_FILENO);
}

/// The child between fork and exec.
[[noreturn]] void BecomeEngine(const WorkFolder& folder, const EngineJob& job, pid_t supervisor) {
    setpgid(0, 0);
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (getppid() != supervisor) // it went before it could take us along
        _exit(EngineCannotStart);
    DefaultSignals();
    RedirectOutput(folder);
    std::vector<std::string> arguments = Arguments(folder, job);
    std::vector<std::string> environment = Environment(folder);
    const std::vector<char*> argumentPointers = ExecWords(arguments);
    const std::vector<char*> environmentPointers = ExecWords(environment);
    if (chdir(folder.Path().c_str()) == 0) {
        DenyNetwork();
        LimitResources(job.limits);
        execve(argumentPointers[0], argumentPointers.data(), environmentPointers.data());
    }
    _exit(EngineCannotStart);
}

} // namespace

std::string DocumentPath(const WorkFolder& folder, const EngineJob& job) {
    return folder.Path() + "/document." + job.extension;
}

std::string PdfPath(const WorkFolder& folder) {
    return folder.Path() + "/out/document.pdf";
}

std::string LogPath(const WorkFolder& folder) {
    return folder.Path() + "/engine.log";
}

EngineProcess::EngineProcess(const WorkFolder& folder, const EngineJob& job) {
    const pid_t supervisor = getpid();
    m_id = fork();
    if (m_id == 0)
        BecomeEngine(folder, job, supervisor);
    if (m_id < 0)
        return;
    setpgid(m_id, m_id); // here too, so that the group exists whoever comes first
    m_exit = WatchProcess(m_id);
}

int EngineProcess::End() {
    int status = 0;
    if (m_id > 0) {
        kill(-m_id, SIGKILL); // nobody has waited for it yet, so the number is still its own
        waitpid(m_id, &status, 0);
    }
    EndChildren();
    return status;
}

} // namespace standins
