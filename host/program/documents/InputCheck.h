#pragma once

#include "host/program/base/Fault.h"
#include "host/program/documents/Inputs.h"

#include <optional>

/// Looks whether a filter can be given the file at all: it must be there, a file, readable, not
/// empty, and have a name that is text. Where the machine is to blame, it may be so another time.
std::optional<Fault> CheckInput(const Input& input);

/// What a person may want to know of a file that its filter found invalid: what it is instead.
/// @param input readable, with an extension of Office documents
/// @param toldByEngine why the application's engine could not open it; may be empty
wxString DescribeInvalid(const Input& input, const wxString& toldByEngine);
