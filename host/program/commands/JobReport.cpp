#include "host/program/commands/JobReport.h"

#include "host/program/base/PathText.h"
#include "host/services/OneLine.h"

#include <wx/datetime.h>
#include <wx/intl.h>

#include <cmath>

namespace {

constexpr JobState AllStates[] = {
    JobState::Waiting,  JobState::Converting, JobState::Submitting,
    JobState::Printing, JobState::Delivering, JobState::Finished,
    JobState::Archived, JobState::Failed,     JobState::Vanished,
};

wxDateTime DateOf(JournalTime time) {
    const auto milliseconds =
        std::chrono::floor<std::chrono::milliseconds>(time.time_since_epoch()).count();
    return wxDateTime(wxLongLong(milliseconds));
}

wxString ReasonOf(const Job& job) {
    return job.fault ? job.fault->Text() : wxString();
}

wxString LineOf(const Job& job, bool tellsMachine) {
    wxString line;
    line << job.id << ' ' << OneLine(job.folder) << '/';
    if (!job.inside.empty())
        line << OneLine(job.inside) << '/';
    line << Shown(job.source.filename()) << ": " << wxGetTranslation(NameOf(job.state));
    if (job.attempts > 0)
        line << ", "
             << wxString::Format(
                    wxPLURAL("%d attempt", "%d attempts", static_cast<unsigned>(job.attempts)),
                    job.attempts);
    if (job.state == JobState::Waiting && job.due > std::chrono::system_clock::now())
        line << ", " << wxString::Format(_("next try %s"), LocalTime(job.due));
    if (job.state == JobState::Converting)
        line << ", " << wxString::Format(_("since %s"), LocalTime(job.begun));
    if (tellsMachine && (job.state == JobState::Converting || HasProduct(job.state)))
        line << ", " << wxString::Format(_("by %s"), OneLine(job.claimedBy));
    if (job.print.number > 0)
        line << ", "
             << wxString::Format(_("job %d of %s"), job.print.number, OneLine(job.print.queue));
    if (!job.print.message.empty())
        line << ", " << OneLine(job.print.message);
    if (job.fault)
        line << ", " << job.fault->code << ' ' << OneLine(job.text) << " ("
             << OneLine(ReasonOf(job)) << ')';
    return line;
}

Json FaultOf(const Job& job) {
    if (!job.fault)
        return {};
    return job.fault->blame == Blame::Document ? "document" : "machine";
}

Json PrintOf(const PrintOrder& order) {
    if (order.number == 0)
        return {};
    return {{"server", JsonText(order.server)},
            {"queue", JsonText(order.queue)},
            {"job", order.number},
            {"held", order.held},
            {"message", JsonText(order.message)}};
}

Json RecordOf(const Job& job) {
    return {{"type", "job"},
            {"id", job.id},
            {"folder", JsonText(job.folder)},
            {"source", job.source.u8string()},
            {"inside", JsonText(job.inside)},
            {"state", NameOf(job.state)},
            {"attempts", job.attempts},
            {"priority", job.priority},
            {"due", RecordTime(job.due)},
            {"begun", RecordTime(job.begun)},
            {"ended", RecordTime(job.ended)},
            {"seconds", std::round(job.seconds * 1000.0) / 1000.0},
            {"output", job.output.empty() ? Json() : Json(job.output.u8string())},
            {"print", PrintOf(job.print)},
            {"code", job.fault ? job.fault->code : 0},
            {"text", JsonText(job.text)},
            {"machine", JsonText(job.claimedBy)},
            {"reason", JsonText(ReasonOf(job))},
            {"fault", FaultOf(job)}};
}

} // namespace

wxString LocalTime(JournalTime time) {
    return DateOf(time).FormatISOCombined(' ');
}

Json RecordTime(JournalTime time) {
    if (time == JournalTime())
        return {};
    return JsonText(DateOf(time).ToUTC().FormatISOCombined() + 'Z');
}

void TellJob(const Job& job, Reporter& reporter, bool tellsMachine) {
    reporter.Line(LineOf(job, tellsMachine));
    reporter.Record(RecordOf(job));
}

void TellFolder(const wxString& folder, const FolderCounts& counts, bool paused,
                Reporter& reporter) {
    wxString line;
    Json record = {{"type", "queue"}, {"folder", JsonText(folder)}};
    for (const JobState state : AllStates) {
        const auto found = counts.jobs.find(state);
        const std::size_t jobs = found == counts.jobs.end() ? 0 : found->second;
        record[NameOf(state)] = jobs;
        if (jobs > 0)
            line << (line.empty() ? "" : ", ")
                 << wxString::Format(_("%zu %s"), jobs, wxGetTranslation(NameOf(state)));
    }
    record["oldestWaiting"] = RecordTime(counts.oldestWaiting.value_or(JournalTime()));
    record["paused"] = paused;
    if (line.empty())
        line = _("nothing yet");
    if (paused)
        line << ", " << _("paused");
    reporter.Line(OneLine(folder) + ": " + line);
    reporter.Record(record);
}
