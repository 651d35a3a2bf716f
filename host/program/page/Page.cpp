#include "host/program/page/Page.h"

#include "host/program/page/PageParts.h"
#include "host/program/page/PageStyle.h"
#include "host/program/page/Wording.h"

namespace {

struct LanguageName {
    const char* language;
    const char* name; ///< in the language itself, UTF-8
};

constexpr LanguageName LanguageNames[] = {
    {"de", "Deutsch"},
    {"en", "English"},
    {"es", "Espa\xC3\xB1ol"},
    {"fr", "Fran\xC3\xA7"
           "ais"},
    {"ja", "\xE6\x97\xA5\xE6\x9C\xAC\xE8\xAA\x9E"},
};

wxString NameOfLanguage(const wxString& language) {
    for (const LanguageName& each : LanguageNames)
        if (language == each.language)
            return wxString::FromUTF8(each.name);
    return language;
}

wxString HtmlLanguage(const Texts& texts) {
    wxString language = texts.Language();
    language.Replace("_", "-");
    return language;
}

/// Without a script the browser itself loads the page anew.
void WriteHead(Html& html, const PageContent& content) {
    html << "<!DOCTYPE html>\n<html lang=\"" << HtmlLanguage(content.texts)
         << "\">\n<head>\n<meta charset=\"utf-8\">\n<title>Quillon</title>\n"
            "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
            "<meta name=\"color-scheme\" content=\"light dark\">\n"
            "<noscript><meta http-equiv=\"refresh\" content=\"10\"></noscript>\n<style nonce=\""
         << content.nonce << "\">" << PageStyle << "</style>\n</head>\n<body>\n";
}

void WriteFooter(Html& html, const PageContent& content) {
    html << "<footer>\n<p>"
         << wxString::Format(content.texts(wxTRANSLATE("Running since %s.")),
                             TimeText(content.status.started))
         << "</p>\n<nav aria-label=\"" << content.texts(wxTRANSLATE("Language")) << "\"><ul>";
    for (const auto& [language, texts] : content.languages.All()) {
        const wxString name = HtmlLanguage(texts);
        html << "<li><a href=\"/?lang=" << language << "\" lang=\"" << name << "\" hreflang=\""
             << name << "\"" << (&texts == &content.texts ? " aria-current=\"true\">" : ">")
             << NameOfLanguage(language) << "</a></li>";
    }
    html << "</ul></nav>\n</footer>\n";
}

/// A part is what the script replaces when it has changed.
void WritePart(Html& html, const PageContent& content, const char* id,
               void (*write)(Html& html, const PageContent& content)) {
    html << "<section id=\"" << id << "\" data-part tabindex=\"-1\">";
    write(html, content);
    html << "</section>\n";
}

} // namespace

std::string WritePage(const PageContent& content) {
    Html html;
    WriteHead(html, content);
    html << "<header><h1>Quillon</h1></header>\n<main>\n<p id=\"away\" class=\"notice bad\" "
            "role=\"alert\" hidden>"
         << content.texts(wxTRANSLATE("The service does not answer. What is shown is out of date."))
         << "</p>\n";
    WritePart(html, content, "state", WriteState);
    WritePart(html, content, "folders", WriteFolders);
    WritePart(html, content, "running", WriteRunning);
    WritePart(html, content, "machines", WriteMachines);
    WritePart(html, content, "failed", WriteFailed);
    WritePart(html, content, "done", WriteDone);
    html << "</main>\n";
    WriteFooter(html, content);
    html << "<script nonce=\"" << content.nonce << "\">" << PageScript
         << "</script>\n</body>\n</html>\n";
    return html.Bytes();
}
