#include "host/program/watch/FailureNote.h"

#include "host/program/base/PathText.h"
#include "host/services/OneLine.h"

#include <wx/datetime.h>
#include <wx/textfile.h>

namespace fs = std::filesystem;

namespace {

wxString TimeText(JournalTime time) {
    return wxDateTime(std::chrono::system_clock::to_time_t(time)).Format("%Y-%m-%d %H:%M:%S");
}

/// As a sentence of its own.
wxString Sentence(const wxString& text, const Texts& texts) {
    wxString sentence = OneLine(text);
    if (sentence.empty())
        return sentence;
    sentence[0] = wxToupper(sentence[0]);
    return sentence.EndsWith(".") ? sentence
                                  : wxString::Format(texts(wxTRANSLATE("%s.")), sentence);
}

/// What can be done to print it after all. It may be damaged, but not once a printer has had it.
wxString WayOut(const Job& job, const fs::path& in, const Texts& texts) {
    const wxString text =
        job.print.number > 0
            ? texts(wxTRANSLATE("What to do: put it back into %s to print it again, or: "
                                "quillon retry %lld"))
            : texts(wxTRANSLATE("What to do: open it in its application, mend it, save it, and put "
                                "it back into %s to try it again. To try it again as it is: "
                                "quillon retry %lld"));
    return wxString::Format(text, Shown(in), static_cast<long long>(job.id));
}

wxString ReasonOf(const Job& job) {
    return job.fault && !job.fault->what.empty() ? job.fault->what : job.text;
}

} // namespace

fs::path NoteOf(const fs::path& document) {
    fs::path note = document;
    note += ".txt";
    return note;
}

std::string NoteFor(const Job& job, const fs::path& in, const Texts& texts) {
    const wxString eol = wxTextFile::GetEOL();
    const wxString name = Shown(job.aside.empty() ? job.source.filename() : job.aside.filename());
    wxString note;
    const auto line = [&note, &eol](const wxString& text) { note << text << eol; };
    line(wxString::Format(texts(wxTRANSLATE("%s could not be printed.")), name));
    line({});
    line(Sentence(ReasonOf(job), texts));
    if (job.fault && !job.fault->advice.empty())
        line(Sentence(job.fault->advice, texts));
    line({});
    line(WayOut(job, in, texts));
    line({});
    line(wxString::Format(texts(wxTRANSLATE("When: %s")), TimeText(job.ended)));
    line(wxString::Format(texts(wxTRANSLATE("Attempts: %d")), job.attempts));
    line(wxString::Format(texts(wxTRANSLATE("Code: %d %s")), job.fault ? job.fault->code : 0,
                          OneLine(job.text)));
    return note.utf8_string();
}
