#include "host/program/watch/WatchedFolder.h"

#include "common/WQServices.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/watch/FreeSpace.h"

using namespace std::chrono_literals;

namespace {

/// After which the machine may have been mended.
constexpr std::chrono::seconds BetweenProbes = 30s;

/// After which settings are put together anew: the machine's printers may be others.
constexpr std::chrono::seconds SettingsLast = 60s;

} // namespace

WatchedFolder::WatchedFolder(const FolderConfiguration& configuration,
                             std::set<std::string> extensions, bool digests, bool wasUsed,
                             std::function<void()> onNews)
    : m_configuration(std::make_shared<const FolderConfiguration>(configuration)),
      m_watcher(*m_configuration, std::move(extensions), digests, wasUsed, std::move(onNews)) {}

void WatchedFolder::Update(const std::set<wxString>& paused, std::uintmax_t minFree,
                           const std::optional<Fault>& shortage) {
    m_view = m_watcher.Look();
    m_isPaused = paused.count(Name()) != 0 || paused.count(wxString()) != 0;
    m_shortage = shortage;
    if (m_view.scans > 0 && m_view.freeBytes < minFree)
        m_shortage = NoSpaceIn(m_configuration->out, m_view.freeBytes, minFree);
}

bool WatchedFolder::MayBegin(Clock::time_point now) const {
    return m_view.hasLooked && !m_view.fault && !m_view.awaitsAdmission && !m_isPaused &&
           !m_shortage && !m_printTrouble && !m_isPrintingFull &&
           (!m_fault || (!m_isProbing && now >= m_probe));
}

void WatchedFolder::Block(Fault fault) {
    if (!m_fault || m_fault->what != fault.what)
        SetLevelAndGetLogger(LevelError, __FILE__, __func__, __LINE__)
            << "The folder " << Name() << " waits: " << fault.Text();
    m_fault = std::move(fault);
    m_probe = Clock::now() + BetweenProbes;
    m_isProbing = false;
}

void WatchedFolder::Unblock() {
    if (m_fault)
        SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
            << "The folder " << Name() << " goes on";
    m_fault.reset();
    m_isProbing = false;
}

std::optional<std::string> WatchedFolder::Settings() {
    std::error_code error;
    FileIdentity file;
    if (m_configuration->settings)
        file = LookAt(*m_configuration->settings, error).identity;
    const Clock::time_point now = Clock::now();
    if (m_settings && !error && file == m_settingsFile && now - m_settingsRead < SettingsLast)
        return m_settings;
    SettingsOptions options;
    if (m_configuration->settings)
        options.file = m_configuration->settings->u8string();
    options.text = m_configuration->settingsText;
    options.assignments = m_configuration->assignments;
    Fault fault;
    const auto settings = MakeRunSettings(options, fault);
    m_settings.reset();
    if (settings)
        m_settings = settings->Xml();
    else
        Block(fault);
    m_settingsFile = file;
    m_settingsRead = now;
    return m_settings;
}

std::optional<Fault> WatchedFolder::Obstacle() const {
    if (m_view.fault)
        return m_view.fault;
    if (m_shortage)
        return m_shortage;
    return m_fault ? m_fault : m_printTrouble;
}

FolderStatus WatchedFolder::Status() const {
    FolderStatus status;
    status.configuration = *m_configuration;
    status.reachable = m_view.hasLooked && !m_view.fault;
    if (const std::optional<Fault> obstacle = Obstacle())
        status.obstacle = obstacle->Text();
    if (m_untold)
        status.obstacle << (status.obstacle.empty() ? "" : "; ") << m_untold->Text();
    status.paused = m_isPaused;
    status.settling = m_view.settling;
    status.freeBytes = m_view.freeBytes;
    return status;
}
