#include "host/program/watch/WatchWork.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/watch/JobDecision.h"
#include "host/program/watch/PrinterPdf.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

/// Before a document's end is tried again.
constexpr std::chrono::seconds BetweenEnds = 30s;

WatchWork::Clock::time_point Now() {
    return WatchWork::Clock::now();
}

} // namespace

WatchWork::WatchWork(Means means, Journal& journal, Folders& folders, const FilterSet& filters)
    : m_means(std::move(means)), m_journal(journal), m_folders(folders), m_filters(filters),
      m_workload(m_means.jobs, m_means.engineDocuments),
      m_pool(m_means.workerArguments, m_means.workerPatience, *this),
      m_printing(
          journal, [&filters](int code) { return filters.ErrorText(code); },
          [this] { m_pool.Wake(); }) {}

WatchWork::~WatchWork() {
    for (auto* const works : {&m_atPrinter, &m_ending})
        for (auto& [ticket, work] : *works)
            if (HasProduct(work.job.state) && work.workplace)
                work.workplace->Leave();
}

bool WatchWork::IsBusy() const {
    return !m_underWay.empty() || HasEndings();
}

bool WatchWork::HasEndings() const {
    return std::any_of(m_ending.begin(), m_ending.end(),
                       [](const auto& entry) { return entry.second.next == Clock::time_point(); });
}

void WatchWork::Step() {
    m_pool.Step(HasEndings() ? 0ms : BetweenSignsOfLife);
}

std::size_t WatchWork::Recover(const std::vector<WatchedFolder*>& folders) {
    std::vector<wxString> names;
    names.reserve(folders.size());
    for (const WatchedFolder* const folder : folders)
        names.push_back(folder->Name());
    std::size_t count = 0;
    for (Job& job : m_journal.TakeOver(names, m_means.claimant))
        count += Adopt(std::move(job)) ? 1 : 0;
    return count;
}

/// @return whether it is not one that this program has in hand
bool WatchWork::Adopt(Job job) {
    if (UnderWay* const known = FindUnderWay(job)) {
        known->job.token = job.token; // the folder was away, its document was not
        return false;
    }
    UnderWay& work = m_ending[++m_lastTicket];
    work.folder = Find(job.folder)->Configuration();
    if (!job.workplace.empty())
        work.workplace = Workplace::TakeOver(job.workplace.parent_path());
    if (job.state == JobState::Converting) {
        DecideByDeath(job, m_filters.ErrorText(ConversionFailed), m_journal.Now());
        work.isToBeTold = true;
    }
    work.job = std::move(job);
    return true;
}

WatchWork::UnderWay* WatchWork::FindUnderWay(const Job& job) {
    for (auto* const works : {&m_underWay, &m_atPrinter, &m_ending})
        for (auto& [ticket, work] : *works)
            if (work.job.id == job.id && work.job.identity == job.identity)
                return &work;
    return nullptr;
}

/// Whether the journal knows of an output that is not in its place, and of which this holds.
bool WatchWork::HasJobWithProduct(const std::function<bool(const Job&)>& isMeant) {
    for (const JobState state : {JobState::Submitting, JobState::Printing, JobState::Delivering}) {
        JobQuery query;
        query.state = state;
        const std::vector<Job> jobs = m_journal.List(query);
        if (std::any_of(jobs.begin(), jobs.end(), isMeant))
            return true;
    }
    return false;
}

void WatchWork::Sweep(const fs::path& outputFolder) {
    const auto isOthers = [&](const Job& job) {
        return !FindUnderWay(job) && job.workplace.parent_path().parent_path() == outputFolder;
    };
    if (HasJobWithProduct(isOthers))
        return; // its folder's turn comes, or it is watched no more
    Workplace::RemoveAbandoned(outputFolder, Workplace::Kind::OfWatch);
}

void WatchWork::BeginJobs() {
    const Clock::time_point now = Now();
    m_workload.Look(m_journal);
    while (m_pool.Busy() < m_workload.WorthwhileJobs(InputsUnderWay())) {
        std::vector<ClaimableFolder> claimable;
        for (const WatchedFolder& folder : m_folders)
            if (folder.MayBegin(now))
                claimable.push_back({folder.Name(), folder.Configuration()->byName});
        std::optional<Job> job =
            claimable.empty() ? std::nullopt : m_journal.Claim(claimable, m_means.claimant);
        if (!job)
            return;
        if (WatchedFolder* const folder = Find(job->folder))
            Begin(std::move(*job), *folder);
    }
}

void WatchWork::Begin(Job job, WatchedFolder& folder) {
    folder.Begin();
    UnderWay work;
    work.folder = folder.Configuration();
    work.shown = {job.id, job.folder, Shown(job.source.filename()), {}, 0, Now()};
    work.job = std::move(job);
    Assignment assignment;
    const WorkerPool::Ticket ticket = ++m_lastTicket;
    if (const std::optional<Fault> fault = Prepare(work, folder, assignment)) {
        work.outcome.emplace();
        work.outcome->input = work.job.source;
        work.outcome->End(fault->blame == Blame::Document ? State::Refused : State::Failed, *fault,
                          m_filters.ErrorText(fault->code));
        m_ending.emplace(ticket, std::move(work));
        return;
    }
    m_underWay.emplace(ticket, std::move(work));
    m_pool.Give(ticket, std::move(assignment));
}

/// Makes what a worker needs.
/// @return why it cannot be had
std::optional<Fault> WatchWork::Prepare(UnderWay& work, WatchedFolder& folder,
                                        Assignment& assignment) {
    if (!IsText(work.job.source)) // it could not be told to the worker
        return Fault{_("its name is not valid UTF-8 text; rename it"), Blame::Document,
                     Result::InvalidInputFile};
    const std::optional<std::string> settings = folder.Settings();
    if (!settings)
        return folder.Obstacle();
    Fault fault;
    work.workplace =
        Workplace::Create(folder.Configuration()->out, fault, Workplace::Kind::OfWatch);
    if (!work.workplace)
        return fault;
    assignment.input = InputOf(work.job);
    assignment.workplace = work.workplace->Path();
    assignment.settings = *settings;
    if (const auto& print = folder.Configuration()->print)
        work.pdfIsForPrinter = m_printing.WantsPdf(print->ticket) && AskForPdf(assignment.settings);
    assignment.language =
        folder.Configuration()->language ? folder.Configuration()->language : m_means.language;
    assignment.engineDocuments = EngineDocuments();
    assignment.identity = work.job.identity;
    assignment.digest = work.job.digest;
    if (!work.job.digest.empty()) { // this machine has numbers of its own for it
        std::error_code error;
        const FileIdentity seen = LookAt(work.job.source, error).identity;
        if (MayBeSame(seen, work.job.identity) && !error)
            assignment.identity = seen;
    }
    assignment.asItIs = folder.Configuration()->others == Others::Pass &&
                        !m_filters.Claiming(ExtensionOf(assignment.input));
    return std::nullopt;
}

void WatchWork::OnProgress(WorkerPool::Ticket ticket, const wxString& step, int percent) {
    RunningDocument& shown = m_underWay.at(ticket).shown;
    shown.step = step;
    shown.percent = std::clamp(percent, 0, 100);
}

void WatchWork::OnOutcome(WorkerPool::Ticket ticket, Outcome outcome) {
    auto work = m_underWay.extract(ticket);
    if (outcome.fault && outcome.text.empty())
        outcome.text = m_filters.ErrorText(outcome.fault->code);
    work.mapped().outcome = std::move(outcome);
    m_ending.insert(std::move(work));
}

bool WatchWork::EndJob() {
    const Clock::time_point now = Now();
    const auto entry = std::find_if(m_ending.begin(), m_ending.end(),
                                    [now](const auto& each) { return each.second.next <= now; });
    if (entry == m_ending.end())
        return false;
    UnderWay& work = entry->second;
    if (work.outcome && work.job.state == JobState::Converting)
        Decide(work);
    try {
        if (End(work))
            m_ending.erase(entry);
        else if (IsAtPrinter(work.job.state))
            m_atPrinter.insert(m_ending.extract(entry));
    } catch (const JobLost&) {
        Abandon(work);
        m_ending.erase(entry);
    }
    return true;
}

/// Leaves a document to whoever has claimed it while this program gave no signs, and with it what
/// has been made of it, if the journal knows of that: that one moves it.
void WatchWork::Abandon(UnderWay& work) {
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "Document " << std::to_string(work.job.id) << " of " << work.job.folder
        << " is somebody else's by now: this program was too slow, or could not be heard";
    const auto isProduct = [&work](const Job& job) {
        return job.workplace.parent_path() == work.workplace->Path();
    };
    if (work.workplace && HasProduct(work.job.state) && HasJobWithProduct(isProduct))
        work.workplace->Leave();
}

Circumstances WatchWork::PresentCircumstances() {
    return {m_journal.Now(), m_journal.Shared() != nullptr};
}

/// What the worker's outcome means for the document and its folder.
void WatchWork::Decide(UnderWay& work) {
    Job& job = work.job;
    const FolderNews news =
        DecideByOutcome(job, *work.outcome, *work.folder, PresentCircumstances());
    if (work.pdfIsForPrinter && job.state == JobState::Submitting)
        SetPdfAside(job);
    WatchedFolder* const folder = Find(job.folder);
    if (folder && news == FolderNews::Works)
        folder->Unblock();
    if (folder && news == FolderNews::None)
        folder->Free();
    if (folder && news == FolderNews::Blocked)
        folder->Block(*job.fault);
    if (news == FolderNews::Blocked)
        m_pool.Retire(0s); // the machine may be mended before the next one
    else if (job.state == JobState::Waiting && m_means.onRetry)
        m_means.onRetry(job);
    work.isToBeTold = job.state != JobState::Delivering; // which its delivery begins with
}

/// @return whether no step is left
bool WatchWork::End(UnderWay& work) {
    if (work.isToBeTold)
        Store(work.job, m_journal);
    work.isToBeTold = false;
    if (IsAtPrinter(work.job.state))
        return false;
    const std::optional<Fault> fault = DoLastSteps(work);
    if (!fault)
        return true;
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__) << fault->Text();
    work.next = Now() + BetweenEnds;
    if (work.job.state == JobState::Delivering)
        if (WatchedFolder* const folder = Find(work.job.folder))
            folder->Block(*fault);
    return false;
}

void WatchWork::PrintJobs() {
    for (auto entry = m_atPrinter.begin(); entry != m_atPrinter.end();) {
        const auto current = entry++;
        UnderWay& work = current->second;
        const WatchedFolder* const folder = Find(work.job.folder);
        const bool hasOther = folder && folder->Configuration()->print; // a queue's name was mended
        try {
            if (m_printing.Advance(current->first, work.job,
                                   hasOther ? *folder->Configuration() : *work.folder))
                m_ending.insert(m_atPrinter.extract(current));
        } catch (const JobLost&) {
            Abandon(work);
            m_printing.LetGo(current->first);
            m_atPrinter.erase(current);
        }
    }
    for (WatchedFolder& folder : m_folders)
        if (const auto& print = folder.Configuration()->print)
            folder.ShowPrinting(m_printing.TroubleOf(folder.Name()),
                                m_printing.CountOf(folder.Name()) >= print->mostQueued);
}

std::optional<Fault> WatchWork::DoLastSteps(UnderWay& work) {
    Job& job = work.job;
    if (job.state == JobState::Delivering)
        if (std::optional<Fault> fault = DeliverProduct(job, *work.folder, m_journal))
            return fault;
    work.workplace.reset();
    Report(work);
    if (!job.open || (job.state != JobState::Finished && job.state != JobState::Failed))
        return std::nullopt;
    return PutSourceAway(job, *work.folder, TextsFor(*work.folder), m_journal);
}

void WatchWork::Report(UnderWay& work) const {
    const JobState state = work.job.state;
    const bool isEnd = state == JobState::Finished || state == JobState::Failed;
    if (!work.outcome || !isEnd || std::exchange(work.isReported, true))
        return;
    work.outcome->made.clear();
    if (state == JobState::Failed && work.outcome->state == State::Converted)
        work.outcome->End(State::Failed, *work.job.fault, work.job.text);
    work.outcome->output = work.job.output;
    m_means.onEnd(work.job, *work.outcome);
}

WatchedFolder* WatchWork::Find(const wxString& name) {
    const auto found =
        std::find_if(m_folders.begin(), m_folders.end(),
                     [&name](const WatchedFolder& folder) { return folder.Name() == name; });
    return found == m_folders.end() ? nullptr : &*found;
}

const Texts& WatchWork::TextsFor(const FolderConfiguration& folder) const {
    const std::optional<std::string>& language =
        folder.language ? folder.language : m_means.language;
    const Texts* const texts = language ? m_texts.Find(wxString::FromUTF8(*language)) : nullptr;
    return texts ? *texts : m_texts.Choose({});
}

void WatchWork::Heartbeat() {
    std::vector<std::int64_t> jobs;
    for (const auto* const works : {&m_underWay, &m_atPrinter, &m_ending})
        for (const auto& [ticket, work] : *works)
            if (work.next == Clock::time_point()) // otherwise another machine may do better
                jobs.push_back(work.job.id);
    m_journal.Heartbeat(m_means.claimant, jobs);
}

/// Those that a worker has.
std::vector<Input> WatchWork::InputsUnderWay() const {
    std::vector<Input> inputs;
    for (const auto& [id, work] : m_underWay)
        inputs.push_back(InputOf(work.job));
    return inputs;
}

unsigned WatchWork::EngineDocuments() {
    std::size_t settling = 0;
    for (const WatchedFolder& folder : m_folders)
        settling += folder.View().settling;
    return m_workload.EngineDocuments(InputsUnderWay(), settling);
}

void WatchWork::Rest() {
    if (m_workload.IsQuiet(!m_underWay.empty()))
        m_pool.Retire(0s);
}

std::vector<RunningDocument> WatchWork::Running() const {
    std::vector<RunningDocument> running;
    for (const auto& [id, work] : m_underWay)
        running.push_back(work.shown);
    return running;
}
