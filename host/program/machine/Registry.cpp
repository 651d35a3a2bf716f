#include "host/program/machine/Registry.h"

wxString RegisteredText(wxRegKey::StdKey root, const wxString& keyName, const wxString& valueName) {
    const wxRegKey key(root, keyName);
    wxString text;
    if (key.Exists() && key.HasValue(valueName))
        key.QueryValue(valueName, text);
    return text;
}
