#include "host/program/page/PageParts.h"

#include "host/program/base/PathText.h"
#include "host/program/page/Health.h"
#include "host/program/page/Wording.h"

#include <algorithm>

namespace {

wxString NameOfDocument(const Job& job) {
    const wxString name = Shown(job.source.filename());
    return job.inside.empty() ? name : OneLine(job.inside) + '/' + name;
}

void WriteFigure(Html& html, const wxString& what, std::size_t number, bool isBad = false) {
    html << "<div><dt>" << what << "</dt><dd" << (isBad && number > 0 ? " class=\"bad\">" : ">")
         << number << "</dd></div>";
}

void WriteReasons(Html& html, const PageContent& content) {
    const std::vector<wxString> reasons =
        ReasonsOfIllness(content.status, content.journal, content.steadyNow, content.texts);
    if (reasons.empty()) {
        html << "<p class=\"notice good\" role=\"status\">"
             << content.texts(wxTRANSLATE("All is well.")) << "</p>\n";
        return;
    }
    html << "<div class=\"notice warn\" role=\"status\"><ul>";
    for (const wxString& reason : reasons)
        html << "<li>" << reason << "</li>";
    html << "</ul></div>\n";
}

void WritePause(Html& html, const PageContent& content) {
    const bool isPaused = IsPaused("", content.status, content.journal);
    BeginForm(html, content, isPaused ? "/resume" : "/pause");
    html << "<button id=\"pause-all\">"
         << content.texts(isPaused ? wxTRANSLATE("Resume all") : wxTRANSLATE("Pause all"))
         << "</button></form>\n";
}

void WriteReason(Html& html, const Job& job, const Texts& texts) {
    const wxString reason = job.fault && !job.fault->what.empty() ? job.fault->what : job.text;
    html << "<p class=\"reason\">" << OneLine(reason) << "</p>\n";
    if (!job.fault)
        return;
    if (!job.fault->advice.empty())
        html << "<p>" << wxString::Format(texts(wxTRANSLATE("%s.")), OneLine(job.fault->advice))
             << "</p>\n";
    html << "<p class=\"quiet\">"
         << wxString::Format(texts(wxTRANSLATE("Code %d: %s")), job.fault->code, OneLine(job.text))
         << "</p>\n";
}

/// What has failed can be tried again when its file is where it is put away.
void WriteRetry(Html& html, const PageContent& content, const Job& job) {
    if (job.open) {
        html << "<p class=\"quiet\">"
             << content.texts(wxTRANSLATE("Its file is still to be put away.")) << "</p>\n";
        return;
    }
    const std::string id = std::to_string(job.id);
    BeginForm(html, content, "/retry");
    html << "<input type=\"hidden\" name=\"id\" value=\"" << id << "\"><button id=\"retry-" << id
         << "\" aria-labelledby=\"retry-" << id << " job-" << id << "\">"
         << content.texts(wxTRANSLATE("Try again")) << "</button></form>\n";
}

void WriteFailedJob(Html& html, const PageContent& content, const Job& job) {
    html << "<li class=\"card row\">\n<div><h3 id=\"job-" << std::to_string(job.id) << "\"><bdi>"
         << NameOfDocument(job) << "</bdi></h3>\n<p class=\"quiet\"><bdi>" << OneLine(job.folder)
         << "</bdi>, <time>" << TimeText(job.ended) << "</time></p>\n";
    WriteReason(html, job, content.texts);
    html << "</div>\n";
    WriteRetry(html, content, job);
    html << "</li>\n";
}

/// With how far it is.
void WriteOwn(Html& html, const PageContent& content, const RunningDocument& document) {
    const auto seconds = std::chrono::duration<double>(content.steadyNow - document.since);
    const auto percent = static_cast<std::size_t>(std::clamp(document.percent, 0, 100));
    const std::string id = std::to_string(document.job);
    html << "<li class=\"card\"><div class=\"row\"><div><h3 id=\"run-" << id << "\"><bdi>"
         << OneLine(document.name) << "</bdi></h3><p class=\"quiet\"><bdi>"
         << OneLine(document.folder) << "</bdi>" << (document.step.empty() ? "" : ", ")
         << OneLine(document.step) << "</p></div><p class=\"quiet\">"
         << DurationText(seconds.count(), content.texts)
         << "</p></div><progress aria-labelledby=\"run-" << id << "\" max=\"100\" value=\""
         << percent << "\"></progress></li>\n";
}

/// With the machine that has it.
void WriteOthers(Html& html, const PageContent& content, const Job& job) {
    html << "<li class=\"card\"><div class=\"row\"><div><h3><bdi>" << NameOfDocument(job)
         << "</bdi></h3><p class=\"quiet\"><bdi>" << OneLine(job.folder) << "</bdi>, "
         << wxString::Format(content.texts(wxTRANSLATE("by %s")), OneLine(job.claimedBy))
         << "</p></div><p class=\"quiet\">" << AgeText(job.begun, content.now, content.texts)
         << "</p></div></li>\n";
}

/// The documents that other machines have under way.
std::vector<Job> OthersOf(const PageContent& content) {
    const std::vector<RunningDocument>& own = content.status.running;
    std::vector<Job> others;
    for (const Job& job : content.journal.converting)
        if (std::none_of(own.begin(), own.end(), [&job](const RunningDocument& document) {
                return document.job == job.id;
            }))
            others.push_back(job);
    return others;
}

} // namespace

std::size_t CountOf(const JournalExtract& journal, JobState state, const wxString* folder) {
    std::size_t sum = 0;
    for (const auto& [name, counts] : journal.counts)
        if (!folder || name == *folder)
            if (const auto found = counts.jobs.find(state); found != counts.jobs.end())
                sum += found->second;
    return sum;
}

std::size_t CountUnderWay(const PageContent& content, const wxString* folder) {
    if (content.journal.machines)
        return CountOf(content.journal, JobState::Converting, folder);
    const std::vector<RunningDocument>& running = content.status.running;
    const auto count =
        std::count_if(running.begin(), running.end(), [folder](const auto& document) {
            return !folder || document.folder == *folder;
        });
    return static_cast<std::size_t>(count);
}

void BeginForm(Html& html, const PageContent& content, const char* action) {
    html << "<form method=\"post\" action=\"" << action
         << "\"><input type=\"hidden\" name=\"token\" value=\"" << content.token << "\">";
    if (content.languageIsChosen)
        html << "<input type=\"hidden\" name=\"lang\" value=\"" << content.texts.Language()
             << "\">";
}

void WriteState(Html& html, const PageContent& content) {
    const Texts& texts = content.texts;
    const JournalExtract& journal = content.journal;
    WriteReasons(html, content);
    html << "<div class=\"bar card\"><dl class=\"figures sums\">";
    WriteFigure(html, texts(wxTRANSLATE("Waiting")), CountOf(journal, JobState::Waiting, nullptr));
    WriteFigure(html, texts(wxTRANSLATE("Under way")), CountUnderWay(content, nullptr));
    WriteFigure(html, texts(wxTRANSLATE("Done")),
                CountOf(journal, JobState::Finished, nullptr) +
                    CountOf(journal, JobState::Archived, nullptr));
    WriteFigure(html, texts(wxTRANSLATE("Failed")), CountOf(journal, JobState::Failed, nullptr),
                true);
    html << "</dl>\n";
    WritePause(html, content);
    html << "</div>\n";
}

void WriteRunning(Html& html, const PageContent& content) {
    const Texts& texts = content.texts;
    const std::vector<Job> others = OthersOf(content);
    html << "<div class=\"bar\"><h2>" << texts(wxTRANSLATE("Under way")) << "</h2></div>\n";
    if (content.status.running.empty() && others.empty()) {
        html << "<p class=\"quiet\">" << texts(wxTRANSLATE("Nothing at the moment.")) << "</p>\n";
        return;
    }
    html << "<ul class=\"list\">\n";
    for (const RunningDocument& document : content.status.running)
        WriteOwn(html, content, document);
    for (const Job& job : others)
        WriteOthers(html, content, job);
    html << "</ul>\n";
}

void WriteFailed(Html& html, const PageContent& content) {
    const Texts& texts = content.texts;
    const std::vector<Job>& failed = content.journal.failed;
    const std::size_t all = CountOf(content.journal, JobState::Failed, nullptr);
    html << "<div class=\"bar\"><h2>" << texts(wxTRANSLATE("Failed")) << "</h2>";
    if (std::any_of(failed.begin(), failed.end(), [](const Job& job) { return !job.open; })) {
        BeginForm(html, content, "/retry");
        html << "<input type=\"hidden\" name=\"all\" value=\"1\"><button id=\"retry-all\">"
             << texts(wxTRANSLATE("Try all again")) << "</button></form>";
    }
    html << "</div>\n";
    if (failed.empty())
        html << "<p class=\"quiet\">" << texts(wxTRANSLATE("Nothing has failed.")) << "</p>\n";
    if (all > failed.size())
        html << "<p class=\"quiet\">"
             << wxString::Format(texts(wxTRANSLATE("The last %lu of %lu are shown.")),
                                 static_cast<unsigned long>(failed.size()),
                                 static_cast<unsigned long>(all))
             << "</p>\n";
    html << "<ol class=\"list\">\n";
    for (const Job& job : failed)
        WriteFailedJob(html, content, job);
    html << "</ol>\n";
}

void WriteDone(Html& html, const PageContent& content) {
    const Texts& texts = content.texts;
    html << "<div class=\"bar\"><h2>" << texts(wxTRANSLATE("Done last")) << "</h2></div>\n";
    if (content.journal.done.empty()) {
        html << "<p class=\"quiet\">" << texts(wxTRANSLATE("Nothing yet.")) << "</p>\n";
        return;
    }
    html << "<ol class=\"card list\">\n";
    for (const Job& job : content.journal.done)
        html << "<li class=\"row\"><p><bdi>" << NameOfDocument(job)
             << "</bdi> <span class=\"quiet\"><bdi>" << OneLine(job.folder) << "</bdi>, <time>"
             << TimeText(job.ended) << "</time></span></p><p class=\"quiet\">"
             << DurationText(job.seconds, texts) << "</p></li>\n";
    html << "</ol>\n";
}
