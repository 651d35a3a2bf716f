#include "host/program/report/Language.h"

#include "host/services/CatalogueLoader.h"

#include <wx/arrstr.h>

namespace {

constexpr const char* English = "en"; // the texts themselves

} // namespace

std::optional<Fault> UseLanguage(const std::optional<wxString>& wanted) {
    auto* const translations = new wxTranslations;
    wxTranslations::Set(translations); // owns it
    translations->SetLoader(new CatalogueLoader(CatalogueLoader::ProgramFolder()));
    if (wanted) {
        wxArrayString languages = translations->GetAvailableTranslations(CatalogueDomain);
        languages.Add(English);
        wxString language = wanted->BeforeFirst('.'); // de_AT.UTF-8
        language.Replace("-", "_");
        if (languages.Index(language) == wxNOT_FOUND)
            language = language.BeforeFirst('_');
        if (languages.Index(language) == wxNOT_FOUND) {
            return Fault{"there are no texts in the language " + *wanted +
                             "; the languages are: " + wxJoin(languages, ' ', 0),
                         Blame::Usage};
        }
        translations->SetLanguage(language);
    }
    translations->AddCatalog(CatalogueDomain);
    return std::nullopt;
}
