#include "host/program/base/PathText.h"
#include "host/program/page/Health.h"
#include "host/program/page/PageParts.h"
#include "host/program/page/Wording.h"

namespace {

void WriteBadge(Html& html, const FolderStatus& folder, bool isPaused, const Texts& texts) {
    const auto write = [&html](const char* kind, const wxString& text) {
        html << "<span class=\"badge " << kind << "\">" << text << "</span>";
    };
    if (!folder.reachable)
        write("bad", texts(wxTRANSLATE("Cannot be reached")));
    else if (isPaused)
        write("warn", texts(wxTRANSLATE("Paused")));
    else if (!folder.obstacle.empty())
        write("warn", texts(wxTRANSLATE("Held up")));
    else
        write("good", texts(wxTRANSLATE("Watched")));
}

void WritePaths(Html& html, const FolderConfiguration& folder, const Texts& texts) {
    html << "<dl class=\"paths\"><dt>" << texts(wxTRANSLATE("In")) << "</dt><dd><bdi>"
         << Shown(folder.in) << "</bdi></dd><dt>" << texts(wxTRANSLATE("Out")) << "</dt><dd><bdi>"
         << Shown(folder.out) << "</bdi></dd></dl>\n";
}

void WriteFigure(Html& html, const wxString& what, const wxString& value,
                 const char* kind = nullptr) {
    html << "<div><dt>" << what << "</dt><dd";
    if (kind)
        html << " class=\"" << kind << "\"";
    html << ">" << value << "</dd></div>";
}

wxString NumberText(std::size_t number) {
    return wxString::Format("%lu", static_cast<unsigned long>(number));
}

wxString OldestText(const PageContent& content, const wxString& folder) {
    const auto counts = content.journal.counts.find(folder);
    if (counts == content.journal.counts.end() || !counts->second.oldestWaiting)
        return wxString::FromUTF8("\xE2\x80\x93"); // a dash
    return AgeText(*counts->second.oldestWaiting, content.now, content.texts);
}

void WriteFigures(Html& html, const PageContent& content, const FolderStatus& folder) {
    const Texts& texts = content.texts;
    const wxString& name = folder.configuration.name;
    const auto of = [&](JobState state) { return CountOf(content.journal, state, &name); };
    const std::size_t failed = of(JobState::Failed);
    html << "<dl class=\"figures\">";
    WriteFigure(html, texts(wxTRANSLATE("Settling")), NumberText(folder.settling));
    WriteFigure(html, texts(wxTRANSLATE("Waiting")), NumberText(of(JobState::Waiting)));
    WriteFigure(html, texts(wxTRANSLATE("Under way")), NumberText(CountUnderWay(content, &name)));
    if (folder.configuration.print)
        WriteFigure(html, texts(wxTRANSLATE("At the printer")),
                    NumberText(of(JobState::Submitting) + of(JobState::Printing)));
    WriteFigure(html, texts(wxTRANSLATE("Done")),
                NumberText(of(JobState::Finished) + of(JobState::Archived)));
    WriteFigure(html, texts(wxTRANSLATE("Failed")), NumberText(failed),
                failed > 0 ? "bad" : nullptr);
    WriteFigure(html, texts(wxTRANSLATE("Oldest waiting")), OldestText(content, name));
    WriteFigure(html, texts(wxTRANSLATE("Free space")),
                folder.reachable ? BytesText(folder.freeBytes)
                                 : wxString::FromUTF8("\xE2\x80\x93"));
    html << "</dl>\n";
}

/// @param index tells the buttons of folders apart, which keep the focus by their names
void WriteButton(Html& html, const PageContent& content, const wxString& folder, bool isPaused,
                 std::size_t index) {
    BeginForm(html, content, isPaused ? "/resume" : "/pause");
    html << "<input type=\"hidden\" name=\"folder\" value=\"" << folder << "\"><button id=\"pause-"
         << index << "\" aria-labelledby=\"pause-" << index << " folder-" << index << "\">"
         << content.texts(isPaused ? wxTRANSLATE("Resume") : wxTRANSLATE("Pause"))
         << "</button></form>";
}

void WriteRetryAll(Html& html, const PageContent& content, const wxString& folder,
                   std::size_t index) {
    BeginForm(html, content, "/retry");
    html << "<input type=\"hidden\" name=\"all\" value=\"1\"><input type=\"hidden\" "
            "name=\"folder\" value=\""
         << folder << "\"><button id=\"again-" << index << "\" aria-labelledby=\"again-" << index
         << " folder-" << index << "\">" << content.texts(wxTRANSLATE("Try all again"))
         << "</button></form>";
}

void WriteFolder(Html& html, const PageContent& content, const FolderStatus& folder,
                 std::size_t index) {
    const wxString& name = folder.configuration.name;
    const bool isPaused = IsPaused(name, content.status, content.journal);
    html << "<article class=\"card\">\n<div class=\"bar\"><h3 id=\"folder-" << index << "\"><bdi>"
         << OneLine(name) << "</bdi></h3>";
    WriteBadge(html, folder, isPaused || IsPaused("", content.status, content.journal),
               content.texts);
    html << "</div>\n";
    if (!folder.obstacle.empty())
        html << "<p class=\"notice warn\">" << OneLine(folder.obstacle) << "</p>\n";
    WritePaths(html, folder.configuration, content.texts);
    WriteFigures(html, content, folder);
    html << "<div class=\"bar\">";
    WriteButton(html, content, name, isPaused, index);
    if (CountOf(content.journal, JobState::Failed, &name) > 0)
        WriteRetryAll(html, content, name, index);
    html << "</div>\n</article>\n";
}

} // namespace

void WriteFolders(Html& html, const PageContent& content) {
    html << "<div class=\"bar\"><h2>" << content.texts(wxTRANSLATE("Folders"))
         << "</h2></div>\n<div class=\"cards\">\n";
    std::size_t index = 0;
    for (const FolderStatus& folder : content.status.folders)
        WriteFolder(html, content, folder, index++);
    html << "</div>\n";
}
