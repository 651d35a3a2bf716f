#include "host/program/watch/WorkEnding.h"

#include "common/WQServices.h"
#include "host/program/watch/JobEnding.h"
#include "host/program/watch/PrinterPdf.h"

using namespace std::chrono_literals;

namespace {

/// Before a document's end is tried again.
constexpr std::chrono::seconds BetweenEnds = 30s;

} // namespace

FolderNews WorkEnding::Decide(DocumentInHand& document) {
    Job& job = document.job;
    const FolderNews news = DecideByOutcome(job, *document.outcome, *document.folder,
                                            {m_journal.Now(), m_journal.Shared() != nullptr});
    if (document.pdfIsForPrinter && job.state == JobState::Submitting)
        SetPdfAside(job);
    WatchedFolder* const folder = m_folders.Find(job.folder);
    if (folder && news == FolderNews::Works)
        folder->Unblock();
    if (folder && news == FolderNews::None)
        folder->Free();
    if (folder && news == FolderNews::Blocked)
        folder->Block(*job.fault);
    if (news != FolderNews::Blocked && job.state == JobState::Waiting && m_means.onRetry)
        m_means.onRetry(job);
    document.isToBeTold = job.state != JobState::Delivering; // which its delivery begins with
    return news;
}

bool WorkEnding::Advance(DocumentInHand& document) {
    if (document.isToBeTold)
        Store(document.job, m_journal);
    document.isToBeTold = false;
    if (IsAtPrinter(document.job.state))
        return false;
    const std::optional<Fault> fault = DoLastSteps(document);
    if (!fault)
        return true;
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__) << fault->Text();
    document.next = DocumentInHand::Clock::now() + BetweenEnds;
    if (document.job.state == JobState::Delivering)
        if (WatchedFolder* const folder = m_folders.Find(document.job.folder))
            folder->Block(*fault);
    return false;
}

std::optional<Fault> WorkEnding::DoLastSteps(DocumentInHand& document) {
    Job& job = document.job;
    if (job.state == JobState::Delivering)
        if (std::optional<Fault> fault = DeliverProduct(job, *document.folder, m_journal))
            return fault;
    document.workplace.reset();
    Report(document);
    if (!job.open || (job.state != JobState::Finished && job.state != JobState::Failed))
        return std::nullopt;
    return PutSourceAway(job, *document.folder, TextsFor(*document.folder), m_journal);
}

void WorkEnding::Report(DocumentInHand& document) const {
    const JobState state = document.job.state;
    const bool isEnd = state == JobState::Finished || state == JobState::Failed;
    if (!document.outcome || !isEnd || std::exchange(document.isReported, true))
        return;
    Outcome& outcome = *document.outcome;
    outcome.made.clear();
    if (state == JobState::Failed && outcome.state == State::Converted)
        outcome.End(State::Failed, *document.job.fault, document.job.text);
    outcome.output = document.job.output;
    m_means.onEnd(document.job, outcome);
}

const Texts& WorkEnding::TextsFor(const FolderConfiguration& folder) const {
    const std::optional<std::string>& language =
        folder.language ? folder.language : m_means.language;
    const Texts* const texts = language ? m_texts.Find(wxString::FromUTF8(*language)) : nullptr;
    return texts ? *texts : m_texts.Choose({});
}
