#include "office/HighQualityDefault.h"

#include <wx/log.h>
#include <wx/msw/registry.h>

namespace {

// The place is PowerPoint 2007's for every version.
constexpr char OptionsKey[] =
    "HKEY_CURRENT_USER\\Software\\Microsoft\\Office\\12.0\\PowerPoint\\Options";
constexpr char DefaultValue[] = "PrintHighQualityDefault";

void Write(long value) {
    const wxLogNull missingKeysAreNoErrors;
    wxRegKey key(OptionsKey);
    if (key.Exists())
        key.SetValue(DefaultValue, value);
}

} // namespace

void HighQualityDefault::Install(bool highQuality) {
    const wxLogNull missingValuesAreNoErrors;
    const wxRegKey key(OptionsKey);
    if (key.Exists() && key.HasValue(DefaultValue))
        key.QueryValue(DefaultValue, &m_saved);
    Write(highQuality ? 1 : 0);
}

void HighQualityDefault::Restore() {
    Write(m_saved);
}
