#pragma once

#include "machine/OfficeApplication.h"
#include "plugin/ResultCodes.h"

#include <wx/string.h>

#include <optional>

/// Something that the machine lacks to convert documents.
struct MissingPart {
    wxString what;                     ///< a sentence without its full stop
    wxString advice;                   ///< what to do about it; may be empty
    int code = Result::NotInitialized; ///< with which filters report that it is missing

    /// Both, without a full stop at the end.
    wxString Text() const;
};

// What is missing, if anything, as it is at the moment. The facts are those that filters go by.

/// An Office application that can be driven: any of them.
std::optional<MissingPart> FindMissingOffice();
std::optional<MissingPart> FindMissingApplication(OfficeApplication application);
/// A PostScript printer.
std::optional<MissingPart> FindMissingPrinter();
/// What makes PDF files.
std::optional<MissingPart> FindMissingPdfMaker();
/// What keeps documents from the rest of the machine.
std::optional<MissingPart> FindMissingIsolation();
/// What files with the extension need to be printed.
/// @param extension without the dot; nothing is known of those that no Office application serves
std::optional<MissingPart> FindMissingFor(const wxString& extension);

/// Why the controls of the filters' settings panels are disabled.
/// @return a text for people, without a full stop at the end; empty when they are not
wxString PanelObstacle();
