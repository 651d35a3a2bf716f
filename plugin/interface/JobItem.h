#pragma once

#include <wx/arrstr.h>
#include <wx/dynarray.h>
#include <wx/string.h>

#include <cstdint>

/// The host's record of one document that a filter has accepted.
struct JobItem {
    wxString pluginIdentifier; ///< the filter that accepted it
    wxString fileName;         ///< name with extension, no folder
    wxArrayString paths;       ///< full paths; this filter's items hold exactly one
    wxString spareText;
    std::int64_t spareValue = 0;
};

/// Accepted documents. The array holds pointers only; its owner, the host, deletes the items.
WX_DEFINE_ARRAY_PTR(JobItem*, JobItemArray);
