#include "standins/office/supervisor/OfficeHost.h"

#include "standins/office/shared/OfficeReach.h"
#include "standins/office/supervisor/LibreOfficeCommand.h"
#include "standins/office/supervisor/Profile.h"
#include "standins/shared/Failure.h"
#include "standins/shared/ProcessTable.h"
#include "standins/supervisor/Heartbeat.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/stat.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <filesystem>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace standins {

namespace {

// Bytes; 130 MB are usual. What it has, each document begins with.
constexpr std::uint64_t MostResident = std::uint64_t{512} << 20;

constexpr int MostFailures = 3;               // in a row, until it is done without
constexpr std::chrono::seconds Patience = 5s; // with a process that uses no processor time

constexpr const char* HostName = "office-host";

/// A file that is installed with this program.
std::string InstalledBeside(const char* name) {
    std::error_code error;
    return fs::read_symlink("/proc/self/exe", error).parent_path() / name;
}

bool HasEnded(const EngineProcess& process) {
    pollfd event{process.ExitDescriptor(), POLLIN, 0};
    return poll(&event, 1, 0) > 0;
}

/// The process opens no document, but its children must not be further confined than to theirs.
Reach HostReach(const HostSettings& settings) {
    Reach reach = OfficeReach(settings.program, settings.fontFolders);
    reach.readable.push_back(InstalledBeside(HostName));
    reach.workFolder = fs::path(settings.folder).parent_path();
    reach.mayFork = true;
    return reach;
}

EngineCommand HostCommand(const HostSettings& settings, const WorkFolder& folder, int nothing,
                          int log, const Channel& channel) {
    EngineCommand command;
    command.words = {InstalledBeside(HostName), settings.program};
    command.words.insert(command.words.end(), settings.fontFolders.begin(),
                         settings.fontFolders.end());
    command.environment = EngineEnvironment(folder.Path());
    command.environment.emplace_back("SAL_USE_VCLPLUGIN=svp");
    command.environment.emplace_back("LD_LIBRARY_PATH=" + settings.program);
    command.folder = folder.Path();
    command.descriptors = {nothing, log, log, channel.Socket()};
    command.times = settings.limits;
    command.resources.memory = settings.mostMemory;
    command.reach = HostReach(settings);
    return command;
}

} // namespace

OfficeHost::OfficeHost(HostSettings settings) : m_settings(std::move(settings)) {}

OfficeHost::~OfficeHost() {
    End();
}

void OfficeHost::Start() {
    if (m_process || m_failures >= MostFailures)
        return;
    auto ends = Channel::MakePair();
    const Descriptor nothing(open("/dev/null", O_RDWR | O_CLOEXEC));
    m_folder.emplace(m_settings.folder);
    if (!ends || !nothing.IsOpen() || !m_folder->IsMade() ||
        !MakeProfile(m_folder->Path(), m_settings.program)) {
        Fail("it cannot be prepared: " + ErrorWords(errno));
        return;
    }
    const Descriptor log(open(LogPath(*m_folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                              S_IRUSR | S_IWUSR));
    m_process.emplace(HostCommand(m_settings, *m_folder, nothing.Get(), log.Get(), ends->second));
    m_channel.emplace(std::move(ends->first));
    if (!m_process->IsStarted())
        Fail("it cannot be started: " + ErrorWords(errno));
}

bool OfficeHost::AwaitReady(const Channel& server) {
    Start();
    if (!m_process || m_isReady)
        return m_isReady;
    const std::optional<Message> answer = Await(server);
    m_isReady = answer && answer->kind == MessageKind::Ready;
    if (!m_isReady)
        Fail(answer ? answer->text : m_reason);
    return m_isReady;
}

std::optional<EngineProcess> OfficeHost::Fork(const HostOrder& order, int log,
                                              const Channel& server) {
    if (m_process && HasEnded(*m_process))
        End();
    if (!AwaitReady(server))
        return std::nullopt;
    m_channel->Send(MessageKind::Job, Encode(order), log); // if it cannot be sent, nothing answers
    const std::optional<Message> answer = Await(server);
    if (!answer || answer->kind != MessageKind::Started)
        return Fail(answer ? answer->text : m_reason);
    const auto child = static_cast<pid_t>(std::strtol(answer->text.c_str(), nullptr, 10));
    EngineProcess engine = EngineProcess::Adopt(child, m_settings.limits);
    if (!engine.IsStarted())
        return Fail("its child cannot be watched: " + ErrorWords(errno));
    ++m_served;
    m_failures = 0;
    return engine;
}

void OfficeHost::RenewIfDue() {
    if (m_process &&
        (m_served >= m_settings.mostDocuments ||
         ResidentBytes(m_process->Group()) > std::min(MostResident, m_settings.mostMemory / 4))) {
        End();
        Start();
    }
}

/// @return nothing when there is no message; m_reason tells why
std::optional<Message> OfficeHost::Await(const Channel& server) {
    Clocks clocks({std::min(Patience, m_settings.limits.stall), m_settings.limits.total});
    Heartbeat heartbeat(server);
    for (;;) {
        std::array<pollfd, 2> events{
            {{m_channel->Socket(), POLLIN, 0}, {server.Socket(), POLLIN, 0}}};
        poll(events.data(), events.size(), static_cast<int>(clocks.Interval().count()));
        if (events[1].revents != 0) {
            m_reason = "nobody waits for it any more";
            return std::nullopt;
        }
        if (events[0].revents != 0) {
            std::optional<Message> message = m_channel->Receive();
            if (!message)
                m_reason = "it ended unexpectedly";
            return message;
        }
        if (clocks.Check({UsageOfGroup(m_process->Group()).cpuTicks, 0}) !=
            Clocks::State::Running) {
            m_reason = "it does not respond";
            return std::nullopt;
        }
        heartbeat.Beat();
    }
}

/// Does without it until it is asked for again.
std::optional<EngineProcess> OfficeHost::Fail(std::string reason) {
    End();
    ++m_failures;
    m_reason = std::move(reason);
    return std::nullopt;
}

void OfficeHost::End() {
    if (m_process)
        m_process->End();
    m_process.reset();
    m_channel.reset();
    m_folder.reset();
    m_isReady = false;
    m_served = 0;
}

} // namespace standins
