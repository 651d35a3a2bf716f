#include "common/Translated.h"

#include <wx/translation.h>

wxString Translated(const wxString& english) {
    if (const wxTranslations* catalogue = wxTranslations::Get())
        if (const wxString* translation = catalogue->GetTranslatedString(english))
            return *translation;
    return wxTranslations::GetUntranslatedString(english);
}
