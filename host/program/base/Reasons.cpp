#include "host/program/base/Reasons.h"

#include <wx/intl.h>

#include <optional>
#include <vector>

namespace {

// %s stands for anything. The first that fits is taken: those that fit much come last, but for
// the one that joins two reasons.
constexpr const char* Patterns[] = {
    wxTRANSLATE("%s; %s"),

    // Of a program that works on the document.
    wxTRANSLATE("%s stopped responding for %s seconds"),
    wxTRANSLATE("%s stopped responding"),
    wxTRANSLATE("%s took longer than %s seconds"),
    wxTRANSLATE("%s took too long"),
    wxTRANSLATE("%s took more than %s MB of memory"),
    wxTRANSLATE("%s used more processor time than it may"),
    wxTRANSLATE("%s wrote a larger file than it may"),
    wxTRANSLATE("%s wrote more than it may"),
    wxTRANSLATE("the machine has run out of memory, and ended %s"),
    wxTRANSLATE("%s was ended from outside (signal %s, %s)"),
    wxTRANSLATE("%s ended with signal %s (%s)"),
    wxTRANSLATE("%s ended with exit code %s"),
    wxTRANSLATE("%s ended unexpectedly"),
    wxTRANSLATE("nobody waits for it any more"),

    // Of the document.
    wxTRANSLATE("it is empty"),
    wxTRANSLATE("it is not a regular file"),
    wxTRANSLATE("it is protected by a password"),
    wxTRANSLATE("no file can have this name"),
    wxTRANSLATE("it is a document of another application"),
    wxTRANSLATE("it is not a document of this application"),
    wxTRANSLATE("it is not a publication"),
    wxTRANSLATE("%s cannot load it"),
    wxTRANSLATE("the file is damaged or not of its type"),
    wxTRANSLATE("%s loaded it, but made no pages of it"),
    wxTRANSLATE("it has no pages"),
    wxTRANSLATE("it is no PDF"),
    wxTRANSLATE("page %s cannot be read"),
    wxTRANSLATE("its outline cannot be read"),
    wxTRANSLATE("%s found an error in it: %s"),
    wxTRANSLATE("%s made no whole PDF of it"),

    // Of the machine.
    wxTRANSLATE("there is no room left in %s"),
    wxTRANSLATE("only %s files may be open (ulimit -n)"),
    wxTRANSLATE("a file may have only %s bytes (ulimit -f)"),
    wxTRANSLATE("a process may have only %s bytes of memory (ulimit -v)"),
    wxTRANSLATE("a process may use only %s seconds of processor time (ulimit -t)"),
    wxTRANSLATE("hardly any more processes and threads can be started (ulimit -u)"),
    wxTRANSLATE("the limit on processes is reached (ulimit -u)"),
    wxTRANSLATE("the limit on open files is reached (ulimit -n)"),
    wxTRANSLATE("the limit on the size of a file is reached (ulimit -f)"),
    wxTRANSLATE("no Ghostscript was found when the stand-in was registered"),
    wxTRANSLATE("Ghostscript is not installed"),
    wxTRANSLATE("there is no profile \"%s\" in %s or %s"),
    wxTRANSLATE("there is no profile \"%s\" in %s"),
    wxTRANSLATE("there is no profile \"%s\""),
    wxTRANSLATE("the profile %s cannot be used: %s"),
    wxTRANSLATE("%s found an error in the profile: %s"),
    wxTRANSLATE("the profile ends %s's work"),
    wxTRANSLATE("it cannot be copied to %s"),
    wxTRANSLATE("no folder can be made in %s"),
    wxTRANSLATE("%s's profile cannot be written"),
    wxTRANSLATE("%s cannot be kept from the rest of the machine"),
    wxTRANSLATE("files are not kept from documents"),
    wxTRANSLATE("the kernel has no Landlock, which needs Linux 5.13, or a container keeps it away"),
    wxTRANSLATE("Landlock is switched off, and must be named in the kernel's parameter lsm="),
    wxTRANSLATE("Landlock cannot be used"),
    wxTRANSLATE("network and processes are not kept from documents"),
    wxTRANSLATE("the kernel has no seccomp"),
    wxTRANSLATE("%s cannot be started"),
    wxTRANSLATE("%s cannot be watched"),

    // Of a process of this program: what it has done.
    wxTRANSLATE("ended with exit code %s"),
    wxTRANSLATE("ended by signal %s, %s"),
    wxTRANSLATE("answered what makes no sense, and was ended"),
    wxTRANSLATE("gave no sign of life any more and was ended"),

    // Parts of reasons.
    wxTRANSLATE("%s's supervisor"),
    wxTRANSLATE("the PostScript writer"),
    wxTRANSLATE("the folder of the output"),
    wxTRANSLATE("the folder of the PDF file"),
    wxTRANSLATE("%s: %s"),
};

/// @return what stands in the text where the pattern has its %s; nothing when it does not fit
std::optional<std::vector<wxString>> Match(const wxString& pattern, const wxString& text) {
    std::vector<wxString> found;
    const std::size_t variable = pattern.find("%s");
    if (variable == wxString::npos)
        return pattern == text ? std::optional(found) : std::nullopt;
    wxString rest;
    if (!text.StartsWith(pattern.substr(0, variable), &rest))
        return std::nullopt;
    const wxString behind = pattern.substr(variable + 2);
    const wxString fixed = behind.substr(0, behind.find("%s"));
    if (fixed.empty()) // the pattern's end
        return rest.empty() ? std::nullopt : std::optional(std::vector{rest});
    for (std::size_t end = rest.find(fixed, 1); end != wxString::npos;
         end = rest.find(fixed, end + 1))
        if (const auto others = Match(behind, rest.substr(end))) {
            found.push_back(rest.substr(0, end));
            found.insert(found.end(), others->begin(), others->end());
            return found;
        }
    return std::nullopt;
}

wxString Fill(const wxString& pattern, const std::vector<wxString>& texts) {
    switch (texts.size()) {
    case 0:
        return pattern;
    case 1:
        return wxString::Format(pattern, texts[0]);
    case 2:
        return wxString::Format(pattern, texts[0], texts[1]);
    default:
        return wxString::Format(pattern, texts[0], texts[1], texts[2]);
    }
}

} // namespace

wxString TranslateReason(const wxString& reason) {
    for (const char* const pattern : Patterns) {
        std::optional<std::vector<wxString>> texts = Match(pattern, reason);
        if (!texts)
            continue;
        for (wxString& text : *texts)
            text = TranslateReason(text);
        return Fill(wxGetTranslation(pattern), *texts);
    }
    return reason;
}
