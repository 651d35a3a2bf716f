#include "host/program/watch/WatchWork.h"

#include "host/program/base/PathText.h"
#include "host/program/watch/JobDecision.h"
#include "host/program/watch/PrinterPdf.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <algorithm>

using namespace std::chrono_literals;

WatchWork::WatchWork(Means means, Journal& journal, WatchedFolders& folders,
                     const FilterSet& filters)
    : m_means(std::move(means)), m_journal(journal), m_folders(folders), m_filters(filters),
      m_recovery(m_means.claimant, journal, folders, filters, m_inHand),
      m_ending({m_means.language, m_means.onEnd, m_means.onRetry}, journal, folders),
      m_workload(m_means.jobs, m_means.engineDocuments),
      m_pool(m_means.workerArguments, m_means.workerPatience, *this),
      m_printing(
          journal, [&filters](int code) { return filters.ErrorText(code); },
          [this] { m_pool.Wake(); }) {}

WatchWork::~WatchWork() {
    m_inHand.LeaveProducts();
}

void WatchWork::Step() {
    m_pool.Step(m_inHand.HasEndings() ? 0ms : BetweenSignsOfLife);
}

void WatchWork::BeginJobs() {
    const Clock::time_point now = Clock::now();
    m_workload.Look(m_journal);
    while (m_pool.Busy() < m_workload.WorthwhileJobs(m_inHand.InputsOfWorkers())) {
        std::vector<ClaimableFolder> claimable;
        for (const WatchedFolder& folder : m_folders)
            if (folder.MayBegin(now))
                claimable.push_back({folder.Name(), folder.Configuration()->byName});
        std::optional<Job> job =
            claimable.empty() ? std::nullopt : m_journal.Claim(claimable, m_means.claimant);
        if (!job)
            return;
        if (WatchedFolder* const folder = m_folders.Find(job->folder))
            Begin(std::move(*job), *folder);
    }
}

void WatchWork::Begin(Job job, WatchedFolder& folder) {
    folder.Begin();
    DocumentInHand document;
    document.folder = folder.Configuration();
    document.shown = {job.id, job.folder, Shown(job.source.filename()), {}, 0, Clock::now()};
    document.job = std::move(job);
    Assignment assignment;
    const WorkInHand::Ticket ticket = m_inHand.NewTicket();
    if (const std::optional<Fault> fault = Prepare(document, folder, assignment)) {
        Outcome& outcome = document.outcome.emplace();
        outcome.input = document.job.source;
        outcome.End(fault->blame == Blame::Document ? State::Refused : State::Failed, *fault,
                    m_filters.ErrorText(fault->code));
        m_inHand.ending.emplace(ticket, std::move(document));
        return;
    }
    m_inHand.converting.emplace(ticket, std::move(document));
    m_pool.Give(ticket, std::move(assignment));
}

/// Makes what a worker needs.
/// @return why it cannot be had
std::optional<Fault> WatchWork::Prepare(DocumentInHand& document, WatchedFolder& folder,
                                        Assignment& assignment) {
    if (!IsText(document.job.source)) // it could not be told to the worker
        return Fault{_("its name is not valid UTF-8 text; rename it"), Blame::Document,
                     Result::InvalidInputFile};
    const std::optional<std::string> settings = folder.Settings();
    if (!settings)
        return folder.Obstacle();
    Fault fault;
    document.workplace =
        Workplace::Create(folder.Configuration()->out, fault, Workplace::Kind::OfWatch);
    if (!document.workplace)
        return fault;
    assignment.input = InputOf(document.job);
    assignment.workplace = document.workplace->Path();
    assignment.settings = *settings;
    if (const auto& print = folder.Configuration()->print)
        document.pdfIsForPrinter =
            m_printing.WantsPdf(print->ticket) && AskForPdf(assignment.settings);
    assignment.language =
        folder.Configuration()->language ? folder.Configuration()->language : m_means.language;
    assignment.engineDocuments =
        m_workload.EngineDocuments(m_inHand.InputsOfWorkers(), m_folders.Settling());
    assignment.identity = document.job.identity;
    assignment.digest = document.job.digest;
    if (!document.job.digest.empty()) { // this machine has numbers of its own for it
        std::error_code error;
        const FileIdentity seen = LookAt(document.job.source, error).identity;
        if (MayBeSame(seen, document.job.identity) && !error)
            assignment.identity = seen;
    }
    assignment.asItIs = folder.Configuration()->others == Others::Pass &&
                        !m_filters.Claiming(ExtensionOf(assignment.input));
    return std::nullopt;
}

void WatchWork::OnProgress(WorkerPool::Ticket ticket, const wxString& step, int percent) {
    RunningDocument& shown = m_inHand.converting.at(ticket).shown;
    shown.step = step;
    shown.percent = std::clamp(percent, 0, 100);
}

void WatchWork::OnOutcome(WorkerPool::Ticket ticket, Outcome outcome) {
    auto document = m_inHand.converting.extract(ticket);
    if (outcome.fault && outcome.text.empty())
        outcome.text = m_filters.ErrorText(outcome.fault->code);
    document.mapped().outcome = std::move(outcome);
    m_inHand.ending.insert(std::move(document));
}

bool WatchWork::EndJob() {
    const Clock::time_point now = Clock::now();
    WorkInHand::Documents& ending = m_inHand.ending;
    const auto entry = std::find_if(ending.begin(), ending.end(),
                                    [now](const auto& each) { return each.second.next <= now; });
    if (entry == ending.end())
        return false;
    DocumentInHand& document = entry->second;
    if (document.outcome && document.job.state == JobState::Converting &&
        m_ending.Decide(document) == FolderNews::Blocked)
        m_pool.Retire(0s); // the machine may be mended before the next one
    try {
        if (m_ending.Advance(document))
            ending.erase(entry);
        else if (IsAtPrinter(document.job.state))
            m_inHand.atPrinter.insert(ending.extract(entry));
    } catch (const JobLost&) {
        m_recovery.Abandon(document);
        ending.erase(entry);
    }
    return true;
}

void WatchWork::PrintJobs() {
    WorkInHand::Documents& atPrinter = m_inHand.atPrinter;
    for (auto entry = atPrinter.begin(); entry != atPrinter.end();) {
        const auto current = entry++;
        DocumentInHand& document = current->second;
        const WatchedFolder* const folder = m_folders.Find(document.job.folder);
        const bool hasOther = folder && folder->Configuration()->print; // a queue's name was mended
        try {
            if (m_printing.Advance(current->first, document.job,
                                   hasOther ? *folder->Configuration() : *document.folder))
                m_inHand.ending.insert(atPrinter.extract(current));
        } catch (const JobLost&) {
            m_recovery.Abandon(document);
            m_printing.LetGo(current->first);
            atPrinter.erase(current);
        }
    }
    for (WatchedFolder& folder : m_folders)
        if (const auto& print = folder.Configuration()->print)
            folder.ShowPrinting(m_printing.TroubleOf(folder.Name()),
                                m_printing.CountOf(folder.Name()) >= print->mostQueued);
}

void WatchWork::Heartbeat() {
    m_journal.Heartbeat(m_means.claimant, m_inHand.Claimed());
}

void WatchWork::Rest() {
    if (m_workload.IsQuiet(!m_inHand.converting.empty()))
        m_pool.Retire(0s);
}
