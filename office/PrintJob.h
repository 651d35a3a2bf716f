#pragma once

#include "plugin/interface/ProgressSink.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/filename.h>
#include <wx/string.h>

// What the drivers of the four applications do alike.

/// Where a document's PostScript goes: the document's name with the ending .ps, in the output
/// folder. A file of that name is not removed first; the application writes over it.
struct PSOutput {
    PSOutput(const wxFileName& document, const wxString& outputFolder);

    wxString fileName;
    wxString path;
};

/// Reports to the host's progress display, if there is one.
class ProgressReporter {
public:
    /// @param sink may be null
    /// @param text what each report names
    ProgressReporter(ProgressSink* sink, const wxString& text) : m_sink(sink), m_text(text) {}

    void operator()(int percent) const {
        if (m_sink)
            m_sink->Report(m_text, percent);
    }

private:
    ProgressSink* m_sink;
    wxString m_text;
};

/// The printer to print on: the Acrobat Distiller printer, where there is one.
/// @param configured the user's printer, otherwise taken; may be empty
/// @return empty when there is none
wxString ChoosePrinter(const wxString& configured);

/// Cuts the printed file to its PostScript header.
/// @return 0, or the result code that says what is wrong with the file
ResultCode RepairOutput(const PSOutput& output);
