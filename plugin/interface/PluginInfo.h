#pragma once

#include <wx/arrstr.h>
#include <wx/string.h>

#include <cstdint>

/// How a plug-in describes itself to the host. The host owns the record and may append fields.
struct PluginInfo {
    std::int32_t kind = 0;    ///< 2 for an input filter
    wxString version;         ///< for instance "1.0.0.1"
    wxString identifier;      ///< unique among the host's plug-ins
    wxString vendor;          ///< shown to the user
    wxArrayString extensions; ///< what the filter claims, without dots
};
