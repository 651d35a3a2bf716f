#pragma once

#include <wx/string.h>

#include <optional>

/// The applications that print documents.
enum class OfficeApplication { Word, Excel, PowerPoint, Publisher };

constexpr OfficeApplication AllOfficeApplications[] = {
    OfficeApplication::Word, OfficeApplication::Excel, OfficeApplication::PowerPoint,
    OfficeApplication::Publisher};

/// The application's name, for people.
const char* NameOf(OfficeApplication application);

/// The name under which COM knows the application, for instance "Word.Application".
const wchar_t* ProgIdOf(OfficeApplication application);

/// @param extension without the dot, in any case
/// @return nothing for an extension that no application serves
std::optional<OfficeApplication> ApplicationForExtension(const wxString& extension);

/// Whether files with the extension are in the Office Open XML format of an application.
/// @param extension without the dot, in any case
bool IsOpenXmlExtension(const wxString& extension);
