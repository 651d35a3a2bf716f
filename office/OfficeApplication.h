#pragma once

#include <wx/string.h>

#include <optional>

/// The applications that print documents for the filter.
enum class OfficeApplication { Word, Excel, PowerPoint, Publisher };

/// The name under which COM knows the application, for instance "Word.Application".
const wchar_t* ProgIdOf(OfficeApplication application);

/// @param extension without the dot, in any case
/// @return nothing for an extension that no application serves
std::optional<OfficeApplication> ApplicationForExtension(const wxString& extension);
