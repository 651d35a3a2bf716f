#pragma once

#include <wx/string.h>

/// The host's progress display. The host owns it.
class ProgressSink {
public:
    /// @param text what is being worked on
    /// @param percent 0 to 100
    /// @return the host's wish to go on; the filter does not look at it
    virtual bool Report(const wxString& text, int percent) = 0;

    virtual ~ProgressSink() = default;
};
