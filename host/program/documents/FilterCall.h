#pragma once

#include "host/program/base/Fault.h"

#include <wx/string.h>

#include <functional>
#include <optional>

/// What a filter has answered.
struct FilterAnswer {
    int code = 0;
    std::optional<Fault> failure; ///< what its engine has told when the code is not 0
};

/// Has a filter work on a document: once more when somebody has ended its engine meanwhile, which
/// says nothing of the document.
/// @param document its name, for the log
/// @param work calls the filter and answers its code
FilterAnswer CallFilter(const wxString& document, const std::function<int()>& work);
