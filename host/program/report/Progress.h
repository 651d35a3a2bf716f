#pragma once

#include "host/program/report/Reporter.h"
#include "plugin/interface/ProgressSink.h"

#include <chrono>

/// A bar with a text behind it, for one line of a terminal.
wxString ProgressLine(int percent, const wxString& text);

/// About how long the rest takes, as long as each part takes what the others took: "0:42".
/// @return empty while nothing can be said
wxString TimeLeft(std::chrono::steady_clock::duration passed, std::size_t done, std::size_t all);

/// Shows how far one document has come: a bar at a terminal, elsewhere a line for each
/// step and each quarter.
class Progress : public ProgressSink {
public:
    /// @param document the document's file name
    Progress(Reporter& reporter, const wxString& document)
        : m_reporter(reporter), m_document(document) {}

    const wxString& Document() const { return m_document; }

    bool Report(const wxString& text, int percent) override;

private:
    void ReportLine(const wxString& step, int percent);

    Reporter& m_reporter;
    wxString m_document;
    int m_lastQuarter = -1;
    wxString m_lastStep;
};
