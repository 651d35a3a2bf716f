#include "host/program/watch/JobDecision.h"

#include "host/program/base/PathText.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

/// How often a document's attempt may end this program, before the document is to blame.
constexpr int MostDeaths = 3;

/// Before a document is tried again that the machine could not convert: longer than its folder
/// waits, so that another one comes first, in case it is this one that the machine cannot do.
constexpr std::chrono::seconds GivenBackFor = 40s;

JournalTime Now() {
    return std::chrono::system_clock::now();
}

void TryAgain(Job& job, std::chrono::seconds delay) {
    job.state = JobState::Waiting;
    job.workplace.clear();
    job.product.clear();
    job.due = Now() + delay;
}

/// A file that is another by now is found anew.
FolderNews DecideChange(Job& job, const FolderConfiguration& folder) {
    std::error_code error;
    if (!fs::is_directory(folder.in, error)) { // nobody can say what is in it
        GiveBack(job);
        return FolderNews::None;
    }
    job.state = JobState::Vanished;
    job.open = false;
    job.ended = Now();
    return FolderNews::None;
}

FolderNews DecideFailure(Job& job, const Outcome& outcome, const FolderConfiguration& folder) {
    job.fault = outcome.fault.value_or(Fault());
    if (job.fault->blame == Blame::Machine || job.fault->blame == Blame::Usage) {
        GiveBack(job);
        return FolderNews::Blocked;
    }
    const auto attempt = static_cast<std::size_t>(std::max(job.attempts, 1));
    if (outcome.state == State::Refused || attempt > folder.retries.size())
        End(job, JobState::Failed);
    else
        TryAgain(job, folder.retries[attempt - 1]);
    return FolderNews::Works;
}

} // namespace

void GiveBack(Job& job) {
    job.attempts = std::max(job.attempts - 1, 0);
    TryAgain(job, GivenBackFor);
}

void End(Job& job, JobState state) {
    job.state = state;
    job.ended = Now();
    job.workplace.clear();
    job.product.clear();
}

FolderNews DecideByOutcome(Job& job, const Outcome& outcome, const FolderConfiguration& folder) {
    job.seconds = outcome.seconds.value_or(0);
    job.text = outcome.text;
    if (outcome.state == State::Changed)
        return DecideChange(job, folder);
    if (outcome.state != State::Converted)
        return DecideFailure(job, outcome, folder);
    job.fault.reset();
    job.workplace = outcome.made.parent_path();
    job.product = ToText(outcome.made.filename());
    job.state = folder.print ? JobState::Submitting : JobState::Delivering;
    return FolderNews::Works;
}

void DecideByDeath(Job& job, const wxString& text) {
    if (++job.deaths < MostDeaths) {
        TryAgain(job, 0s);
        return;
    }
    job.fault = {wxString::Format(_("it ended the program %d times"), job.deaths)};
    job.text = text;
    End(job, JobState::Failed);
}
