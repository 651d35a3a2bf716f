#include "host/program/watch/JobDecision.h"

#include "host/program/base/PathText.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

/// How often a document's attempt may end this program, before the document is to blame.
constexpr int MostDeaths = 3;

/// For how long a machine may not see what another one has found: what a share's client knows of a
/// folder is some seconds old.
constexpr std::chrono::seconds SharesAreLateFor = 60s;
constexpr std::chrono::seconds BetweenLooks = 5s;

void TryAgain(Job& job, std::chrono::seconds delay, JournalTime now) {
    job.state = JobState::Waiting;
    job.workplace.clear();
    job.product.clear();
    job.due = now + delay;
}

/// A file that is another by now is found anew.
FolderNews DecideChange(Job& job, const FolderConfiguration& folder,
                        const Circumstances& circumstances) {
    std::error_code error;
    if (!fs::is_directory(folder.in, error)) { // nobody can say what is in it
        GiveBack(job, circumstances);
        return FolderNews::None;
    }
    if (circumstances.isShared && circumstances.now - job.inserted < SharesAreLateFor) {
        GiveBack(job, circumstances);
        job.due = circumstances.now + BetweenLooks;
        return FolderNews::None;
    }
    job.state = JobState::Vanished;
    job.open = false;
    job.ended = circumstances.now;
    return FolderNews::None;
}

FolderNews DecideFailure(Job& job, const Outcome& outcome, const FolderConfiguration& folder,
                         const Circumstances& circumstances) {
    job.fault = outcome.fault.value_or(Fault());
    if (job.fault->blame == Blame::Machine || job.fault->blame == Blame::Usage) {
        GiveBack(job, circumstances);
        return FolderNews::Blocked;
    }
    const auto attempt = static_cast<std::size_t>(std::max(job.attempts, 1));
    if (outcome.state == State::Refused || attempt > folder.retries.size())
        End(job, JobState::Failed, circumstances.now);
    else
        TryAgain(job, folder.retries[attempt - 1], circumstances.now);
    return FolderNews::Works;
}

} // namespace

void GiveBack(Job& job, const Circumstances& circumstances, std::chrono::seconds delay) {
    job.attempts = std::max(job.attempts - 1, 0);
    TryAgain(job, circumstances.isShared ? 0s : delay, circumstances.now);
}

void End(Job& job, JobState state, JournalTime now) {
    job.state = state;
    job.ended = now;
    job.workplace.clear();
    job.product.clear();
}

FolderNews DecideByOutcome(Job& job, const Outcome& outcome, const FolderConfiguration& folder,
                           const Circumstances& circumstances) {
    job.seconds = outcome.seconds.value_or(0);
    job.text = outcome.text;
    if (outcome.state == State::Changed)
        return DecideChange(job, folder, circumstances);
    if (outcome.state != State::Converted)
        return DecideFailure(job, outcome, folder, circumstances);
    job.fault.reset();
    job.workplace = outcome.made.parent_path();
    job.product = ToText(outcome.made.filename());
    job.state = folder.print ? JobState::Submitting : JobState::Delivering;
    return FolderNews::Works;
}

void DecideByDeath(Job& job, const wxString& text, JournalTime now) {
    if (++job.deaths < MostDeaths) {
        TryAgain(job, 0s, now);
        return;
    }
    job.fault = {wxString::Format(_("it ended the program %d times"), job.deaths)};
    job.text = text;
    End(job, JobState::Failed, now);
}
