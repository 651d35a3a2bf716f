#include "host/program/watch/FolderWatcher.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/OutputFolder.h"
#include "host/program/system/Digest.h"
#include "host/program/system/FileSystemKind.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

// Between scans when nothing tells of a change, and between tries to see a folder that is away.
constexpr std::chrono::milliseconds LocalInterval = 10s;
constexpr std::chrono::milliseconds ShareInterval = 5s;
constexpr std::chrono::seconds LongestBackoff = 60s;

// While many files come, scans are to take no more than a part of the time.
constexpr std::chrono::milliseconds ShortestInterval = 50ms;
constexpr int ShareOfTime = 5;

/// After which a folder that does not answer counts as being away.
constexpr std::chrono::seconds LongestSilence = 30s;

Fault Away(const wxString& what) {
    return {what, Blame::Machine};
}

/// @return why there is no such folder to put sources away to
std::optional<Fault> MakeFolder(const fs::path& folder) {
    std::error_code error;
    fs::create_directory(folder, error);
    if (!error && fs::is_directory(folder, error))
        return std::nullopt;
    return Away(wxString::Format(_("%s cannot be made: %s"), Shown(folder),
                                 error ? Because(error) : _("it is a file, not a folder")));
}

} // namespace

FolderWatcher::FolderWatcher(const FolderConfiguration& configuration,
                             std::set<std::string> extensions, bool digests, bool wasUsed,
                             std::function<void()> onNews)
    : m_configuration(configuration), m_extensions(std::move(extensions)), m_digests(digests),
      m_onNews(std::move(onNews)), m_wasUsed(wasUsed || configuration.isOthers),
      m_alive(Clock::now().time_since_epoch().count()), m_thread([this] { Run(); }) {}

FolderWatcher::~FolderWatcher() {
    m_stopping = true;
    m_bell.Ring();
    m_thread.join();
}

FolderWatcher::View FolderWatcher::Look() const {
    const std::lock_guard lock(m_mutex);
    View view = m_view;
    const Clock::time_point alive{Clock::duration(m_alive.load())};
    if (!view.fault &&
        Clock::now() - alive > std::max<Clock::duration>(LongestSilence, ShareInterval * 2)) {
        view.fault = Away(_("the folder does not answer"));
        view.awaitsAdmission = false;
    }
    return view;
}

std::vector<SettledFile> FolderWatcher::Take() {
    const std::lock_guard lock(m_mutex);
    return std::exchange(m_settled, {});
}

void FolderWatcher::Admit() {
    {
        const std::lock_guard lock(m_mutex);
        m_view.awaitsAdmission = false;
    }
    m_admitted = true;
    m_bell.Ring();
}

void FolderWatcher::Forget() {
    m_forgetful = true;
    m_bell.Ring();
}

void FolderWatcher::Run() {
    while (!m_stopping) {
        StayAlive();
        if (m_scan && m_admitted) {
            Scan();
        } else if (!m_scan) {
            if (std::optional<Fault> fault = Open())
                Close(std::move(*fault));
        }
        StayAlive();
        AwaitNextLook();
    }
}

/// Has the folder for this program alone.
/// @return why it has not
std::optional<Fault> FolderWatcher::TakePossession() {
    Fault fault;
    m_lock = FolderLock::Take(m_configuration.in, fault);
    if (!m_lock)
        return fault;
    for (const char* const name : {ProcessedFolder, FailedFolder})
        if (auto obstacle = MakeFolder(m_configuration.in / name))
            return obstacle;
    return std::nullopt;
}

/// Begins with the folder, where it is there.
/// @return why it is not
std::optional<Fault> FolderWatcher::Open() {
    std::error_code error;
    const fs::path& in = m_configuration.in;
    const FileLook look = LookAt(fs::canonical(in, error), error);
    if (error || look.type != fs::file_type::directory)
        return Away(wxString::Format(_("%s cannot be seen: %s"), Shown(in),
                                     error ? Because(error) : _("it is a file, not a folder")));
    if (m_wasUsed && !fs::exists(in / ProcessedFolder, error) &&
        !fs::exists(in / FailedFolder, error))
        return Away(wxString::Format(
            _("%s is not the folder that was watched before. Mount it again; if it is really to be "
              "watched anew, make a folder \"%s\" in it"),
            Shown(in), ProcessedFolder));
    Fault fault;
    if (!OutputFolder::Open(m_configuration.out, fault))
        return Away(wxString::Format(_("the output folder %s cannot be used: %s"),
                                     Shown(m_configuration.out), fault.what));
    if (!m_configuration.isOthers)
        if (std::optional<Fault> obstacle = TakePossession())
            return obstacle;
    m_device = look.identity.device;
    m_isShare = IsShare(in);
    m_scan.emplace(MakeRules());
    m_wasUsed = true;
    m_backoff = 1s;
    m_admitted = false;
    m_next.reset();
    {
        const std::lock_guard lock(m_mutex);
        m_view.hasLooked = true;
        m_view.fault.reset();
        m_view.awaitsAdmission = true;
    }
    m_onNews();
    return std::nullopt;
}

/// @return nothing new where another machine does that
ScanResult FolderWatcher::LookForDocuments(Clock::time_point now) {
    if (m_configuration.isOthers)
        return {};
    ScanResult result = m_scan->Scan(now);
    if (!m_digests)
        return result;
    std::error_code error;
    for (SettledFile& file : std::exchange(result.settled, {})) {
        file.digest = DigestOf(file.path, error, [this] { StayAlive(); });
        if (error) // it is found anew, unless it has gone
            m_forgetful = true;
        else
            result.settled.push_back(std::move(file));
    }
    return result;
}

void FolderWatcher::Scan() {
    std::error_code error;
    const FileLook look = LookAt(fs::canonical(m_configuration.in, error), error);
    if (!error && look.identity.device != m_device)
        return Close(Away(
            wxString::Format(_("%s is on another device than before"), Shown(m_configuration.in))));
    if (error && m_configuration.isOthers)
        return Close(Away(wxString::Format(_("%s cannot be seen: %s"), Shown(m_configuration.in),
                                           Because(error))));
    if (m_forgetful.exchange(false))
        m_scan->Forget();
    const Clock::time_point start = Clock::now();
    ScanResult result = LookForDocuments(start);
    const fs::space_info space = fs::space(m_configuration.out, error);
    if (result.error || error)
        return Close(
            Away(wxString::Format(_("%s cannot be seen: %s"),
                                  Shown(result.error ? m_configuration.in : m_configuration.out),
                                  Because(result.error ? result.error : error))));
    m_next = result.next;
    m_lastScan = Clock::now();
    m_lastScanTook = std::chrono::duration_cast<std::chrono::milliseconds>(m_lastScan - start);
    const bool isNews = !result.settled.empty();
    {
        const std::lock_guard lock(m_mutex);
        m_settled.insert(m_settled.end(), result.settled.begin(), result.settled.end());
        m_view.settling = result.settling;
        m_view.freeBytes = space.available;
        ++m_view.scans;
    }
    if (isNews)
        m_onNews();
}

/// Lets go of the folder, to try it again later.
void FolderWatcher::Close(Fault fault) {
    m_scan.reset();
    m_lock.reset();
    m_admitted = false;
    m_backoff = std::min(m_backoff * 2, LongestBackoff);
    {
        const std::lock_guard lock(m_mutex);
        m_view.hasLooked = true;
        m_view.fault = std::move(fault);
        m_view.awaitsAdmission = false;
        m_view.settling = 0;
        m_settled.clear();
    }
    m_onNews();
}

FolderScan::Rules FolderWatcher::MakeRules() {
    FolderScan::Rules rules;
    rules.folder = m_configuration.in;
    rules.settle = SettleTime(m_configuration, m_isShare);
    rules.asksForWriters = !m_isShare;
    rules.folderIsJob = m_configuration.folderIsJob;
    rules.takesOthers = m_configuration.others != Others::Leave;
    rules.extensions = m_extensions;
    rules.onFolder = [this](const fs::path& folder) { m_bell.Watch(folder); };
    rules.onProgress = [this] { StayAlive(); };
    return rules;
}

/// Waits until another look may find something. The bell may end that, but while it rings all the
/// time, the folder is not looked at all the time.
void FolderWatcher::AwaitNextLook() {
    if (!m_scan) {
        m_bell.Wait(m_backoff);
        return;
    }
    const std::chrono::milliseconds interval = m_isShare ? ShareInterval : LocalInterval;
    m_bell.Wait(m_next ? std::min(*m_next, interval) : interval);
    const Clock::time_point earliest =
        m_lastScan + std::max(ShortestInterval, m_lastScanTook * ShareOfTime);
    while (!m_stopping && Clock::now() < earliest)
        std::this_thread::sleep_for(ShortestInterval);
}
