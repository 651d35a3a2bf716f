#include "tests/support/linux/CupsServer.h"

#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <thread>
#include <vector>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr const char* Program = "/usr/sbin/cupsd";
constexpr uid_t Nobody = 65534;

constexpr const char* Configuration = R"(LogLevel info
MaxLogSize 0
Listen @/socket
Browsing No
WebInterface No
DirtyCleanInterval 0
DefaultAuthType None
<Location />
  Order allow,deny
  Allow all
</Location>
<Policy default>
  JobPrivateAccess all
  JobPrivateValues none
  <Limit All>
    Order allow,deny
    Allow all
  </Limit>
</Policy>
)";

constexpr const char* Files = R"(ServerRoot @/etc
ServerBin @/lib
DataDir /usr/share/cups
DocumentRoot @/doc
CacheDir @/cache
StateDir @/state
RequestRoot @/spool
TempDir @/tmp
ErrorLog @/error_log
AccessLog @/access_log
PageLog @/page_log
FileDevice Yes
SystemGroup nogroup
)";

std::string In(const fs::path& folder, std::string text) {
    for (std::size_t at = 0; (at = text.find('@', at)) != std::string::npos;)
        text.replace(at, 1, folder.string());
    return text;
}

std::string TextOf(ipp_t* answer, const char* attribute) {
    const char* const text =
        ippGetString(ippFindAttribute(answer, attribute, IPP_TAG_ZERO), 0, nullptr);
    return text ? text : "";
}

} // namespace

CupsServer::CupsServer() {
    for (const char* const name : {"etc", "etc/ppd", "lib", "lib/filter", "lib/backend", "doc",
                                   "cache", "state", "state/certs", "spool", "tmp", "out"})
        fs::create_directory(m_folder / name);
    LinkPrograms();
    Configure();
    setenv("CUPS_SERVER", Socket().c_str(), 1);
}

CupsServer::~CupsServer() {
    End(SIGKILL);
    unsetenv("CUPS_SERVER");
}

std::string CupsServer::Obstacle(const fs::path& program) {
    if (!fs::exists(Program))
        return "CUPS is not installed";
    for (fs::path folder = program; geteuid() == 0 && folder != folder.root_path();
         folder = folder.parent_path())
        if ((fs::status(folder).permissions() & fs::perms::others_exec) == fs::perms::none)
            return "the user nobody cannot look into " + folder.string();
    return {};
}

/// The system's programs, but for those of the program under test.
void CupsServer::LinkPrograms() const {
    for (const char* const kind : {"filter", "backend"})
        for (const auto& entry : fs::directory_iterator(fs::path("/usr/lib/cups") / kind))
            if (entry.path().filename() != "quillon")
                fs::create_symlink(entry.path(), ServerBin() / kind / entry.path().filename());
    fs::create_symlink("/usr/lib/cups/daemon", ServerBin() / "daemon");
}

void CupsServer::Configure() const {
    m_folder.Write("etc/cupsd.conf", In(m_folder.Path(), Configuration));
    m_folder.Write("etc/cups-files.conf", In(m_folder.Path(), Files));
    if (geteuid() != 0)
        return;
    for (const auto& entry : fs::recursive_directory_iterator(m_folder.Path()))
        EXPECT_EQ(lchown(entry.path().c_str(), Nobody, Nobody), 0) << entry.path();
    EXPECT_EQ(chown(m_folder.Path().c_str(), Nobody, Nobody), 0);
}

void CupsServer::Start() {
    const std::string user = std::to_string(Nobody);
    const std::string configuration = ServerRoot() / "cupsd.conf";
    const std::string files = ServerRoot() / "cups-files.conf";
    std::vector<std::string> words = {Program, "-f", "-c", configuration, "-s", files};
    if (geteuid() == 0)
        words.insert(words.begin(), {"/usr/bin/setpriv", "--reuid", user, "--regid", user,
                                     "--clear-groups", "--"});
    std::vector<char*> arguments;
    arguments.reserve(words.size() + 1);
    for (std::string& word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    ASSERT_EQ(posix_spawn(&m_process, arguments[0], nullptr, nullptr, arguments.data(), environ),
              0);
    const auto end = std::chrono::steady_clock::now() + 20s;
    while (!Ask(ippNewRequest(IPP_OP_CUPS_GET_DEFAULT), "/")) {
        ASSERT_LT(std::chrono::steady_clock::now(), end) << ReadBytes(m_folder / "error_log");
        std::this_thread::sleep_for(5ms);
    }
}

void CupsServer::Stop() {
    End(SIGTERM);
}

void CupsServer::Kill() {
    End(SIGKILL);
}

void CupsServer::End(int signal) {
    if (m_process <= 0)
        return;
    kill(m_process, signal);
    waitpid(m_process, nullptr, 0);
    m_process = -1;
}

/// @param request belongs to it
CupsServer::Answer CupsServer::Ask(ipp_t* request, const std::string& resource,
                                   const fs::path& file) const {
    const std::unique_ptr<http_t, void (*)(http_t*)> connection(
        httpConnect2(Socket().c_str(), 0, nullptr, AF_UNSPEC, HTTP_ENCRYPTION_IF_REQUESTED, 1, 1000,
                     nullptr),
        httpClose);
    if (!connection) {
        ippDelete(request);
        return {nullptr, ippDelete};
    }
    return {cupsDoFileRequest(connection.get(), request, resource.c_str(),
                              file.empty() ? nullptr : file.c_str()),
            ippDelete};
}

void CupsServer::AddQueue(const std::string& name, const std::string& device, const fs::path& ppd) {
    ipp_t* const request = ippNewRequest(IPP_OP_CUPS_ADD_MODIFY_PRINTER);
    ippAddString(request, IPP_TAG_OPERATION, IPP_TAG_URI, "printer-uri", nullptr,
                 ("ipp://localhost/printers/" + name).c_str());
    ippAddString(request, IPP_TAG_PRINTER, IPP_TAG_URI, "device-uri", nullptr, device.c_str());
    ippAddInteger(request, IPP_TAG_PRINTER, IPP_TAG_ENUM, "printer-state", IPP_PSTATE_IDLE);
    ippAddBoolean(request, IPP_TAG_PRINTER, "printer-is-accepting-jobs", 1);
    const Answer answer = Ask(request, "/admin/", ppd);
    ASSERT_TRUE(answer) << cupsLastErrorString();
    ASSERT_LE(ippGetStatusCode(answer.get()), IPP_STATUS_OK_CONFLICTING) << cupsLastErrorString();
}

void CupsServer::AddBackend(const std::string& name, const std::string& script) const {
    const fs::path file = m_folder.Write("lib/backend/" + name, "#!/bin/sh\n" + script);
    fs::permissions(file, fs::perms::owner_all | fs::perms::group_exec | fs::perms::group_read |
                              fs::perms::others_exec | fs::perms::others_read);
}

CupsServer::Job CupsServer::Look(int job) const {
    ipp_t* const request = ippNewRequest(IPP_OP_GET_JOB_ATTRIBUTES);
    ippAddString(request, IPP_TAG_OPERATION, IPP_TAG_URI, "job-uri", nullptr,
                 ("ipp://localhost/jobs/" + std::to_string(job)).c_str());
    const Answer answer = Ask(request, "/");
    const auto number = [&answer](const char* name) {
        return ippGetInteger(ippFindAttribute(answer.get(), name, IPP_TAG_ZERO), 0);
    };
    return {static_cast<ipp_jstate_t>(number("job-state")), number("job-impressions-completed"),
            TextOf(answer.get(), "job-printer-state-message")};
}

std::string CupsServer::PrinterMessage(const std::string& queue) const {
    ipp_t* const request = ippNewRequest(IPP_OP_GET_PRINTER_ATTRIBUTES);
    ippAddString(request, IPP_TAG_OPERATION, IPP_TAG_URI, "printer-uri", nullptr,
                 ("ipp://localhost/printers/" + queue).c_str());
    return TextOf(Ask(request, "/").get(), "printer-state-message");
}
