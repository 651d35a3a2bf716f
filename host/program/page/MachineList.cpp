#include "host/program/journal/Machines.h"
#include "host/program/page/PageParts.h"
#include "host/program/page/Wording.h"

namespace {

void WriteBadge(Html& html, const Machine& machine, const Texts& texts) {
    if (!machine.isAlive)
        html << "<span class=\"badge bad\">" << texts(wxTRANSLATE("Not heard of"));
    else if (!machine.obstacle.empty())
        html << "<span class=\"badge warn\">" << texts(wxTRANSLATE("Held up"));
    else
        html << "<span class=\"badge good\">" << texts(wxTRANSLATE("Running"));
    html << "</span>";
}

wxString ListOf(const std::vector<wxString>& parts) {
    wxString list;
    for (const wxString& part : parts)
        list << (list.empty() ? "" : ", ") << OneLine(part);
    return list;
}

wxString ListOf(const std::set<std::string>& extensions) {
    std::vector<wxString> parts;
    parts.reserve(extensions.size());
    for (const std::string& extension : extensions)
        parts.push_back(wxString::FromUTF8(extension));
    return ListOf(parts);
}

/// What is to be known of it before documents are sent its way.
void WriteRemarks(Html& html, const PageContent& content, const Machine& machine,
                  const PageMakers& common) {
    const Texts& texts = content.texts;
    const auto write = [&html](const char* kind, const wxString& text) {
        html << "<p class=\"" << kind << "\">" << text << "</p>\n";
    };
    write("quiet", ListOf(WorkOf(machine, std::cref(texts))));
    if (const auto differences = DifferencesOf(machine, common, std::cref(texts));
        !differences.empty())
        write("quiet", wxString::Format(texts(wxTRANSLATE("differs: %s")), ListOf(differences)));
    if (!machine.cannot.empty())
        write("quiet", wxString::Format(texts(wxTRANSLATE("has nothing to open %s with")),
                                        ListOf(machine.cannot)));
    if (machine.isAlive && !machine.obstacle.empty())
        write("reason", OneLine(machine.obstacle));
}

void WriteMachine(Html& html, const PageContent& content, const Machine& machine,
                  const PageMakers& common) {
    html << "<li class=\"row\"><div><h3><bdi>" << OneLine(machine.name) << "</bdi> ";
    WriteBadge(html, machine, content.texts);
    html << "</h3>\n";
    WriteRemarks(html, content, machine, common);
    html << "</div><p class=\"quiet\">";
    if (Converts(machine))
        html << wxString::Format(content.texts(wxTRANSLATE("%zu under way")), machine.running);
    else if (!machine.isAlive)
        html << wxString::Format(content.texts(wxTRANSLATE("since %s")), TimeText(machine.seen));
    html << "</p></li>\n";
}

} // namespace

void WriteMachines(Html& html, const PageContent& content) {
    if (!content.journal.machines)
        return;
    const std::vector<Machine>& machines = *content.journal.machines;
    const PageMakers common = CommonMakers(machines);
    html << "<div class=\"bar\"><h2>" << content.texts(wxTRANSLATE("Machines")) << "</h2></div>\n";
    if (machines.empty()) {
        html << "<p class=\"quiet\">" << content.texts(wxTRANSLATE("None at the moment."))
             << "</p>\n";
        return;
    }
    html << "<ul class=\"card list\">\n";
    for (const Machine& machine : machines)
        WriteMachine(html, content, machine, common);
    html << "</ul>\n";
}
