#pragma once

#include "host/program/Reporter.h"
#include "plugin/ProgressSink.h"

/// Shows how far one document has come: a bar at a terminal, a line for each step elsewhere.
class Progress : public ProgressSink {
public:
    /// @param document the document's name, for people
    Progress(Reporter& reporter, const wxString& document)
        : m_reporter(reporter), m_document(document) {}

    bool Report(const wxString& text, int percent) override;

private:
    Reporter& m_reporter;
    wxString m_document;
    wxString m_last;
};
