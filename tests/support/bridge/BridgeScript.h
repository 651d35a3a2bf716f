#pragma once

#include <windows.h>

#include <wx/string.h>

/// Below HKEY_CURRENT_USER; the values are BridgeScript's to write and read.
constexpr wchar_t BridgeScriptKey[] = L"Software\\Scripted Bridge";

/// A number there; unless it is 0 the bridge makes a file.
constexpr wchar_t MakesPdfValue[] = L"MakesPdf";

/// Tells the scripted bridge what to answer, and what it was asked. Puts the bridge into a folder
/// of filters of its own, which the filter finds by the installation's registry key.
class BridgeScript {
public:
    /// @param installFolder receives a folder "Filters" with the bridge in it
    explicit BridgeScript(const wxString& installFolder);
    ~BridgeScript();
    BridgeScript(const BridgeScript&) = delete;
    BridgeScript& operator=(const BridgeScript&) = delete;

    void Answer(long result);
    void Throw();

    long Calls() const;
    wxString PSPath() const;
    wxString PDFPath() const;
    wxString Profile() const;
    /// COM was there during the call, and the reserved fields of the record were zero.
    bool WasCalledProperly() const;
};
