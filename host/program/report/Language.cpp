#include "host/program/report/Language.h"

#include "host/services/CatalogueLoader.h"

#include <wx/arrstr.h>

namespace {

constexpr const char* English = "en"; // the texts themselves

} // namespace

std::optional<wxString> FindLanguage(const wxString& wanted, Fault& fault) {
    wxArrayString languages =
        CatalogueLoader(CatalogueLoader::ProgramFolder()).GetAvailableTranslations(CatalogueDomain);
    languages.Add(English);
    wxString language = wanted.BeforeFirst('.'); // de_AT.UTF-8
    language.Replace("-", "_");
    if (languages.Index(language) == wxNOT_FOUND)
        language = language.BeforeFirst('_');
    if (languages.Index(language) != wxNOT_FOUND)
        return language;
    fault = {"there are no texts in the language " + wanted +
                 "; the languages are: " + wxJoin(languages, ' ', 0),
             Blame::Usage};
    return std::nullopt;
}

std::optional<Fault> UseLanguage(const std::optional<wxString>& wanted) {
    auto* const translations = new wxTranslations;
    wxTranslations::Set(translations); // owns it
    translations->SetLoader(new CatalogueLoader(CatalogueLoader::ProgramFolder()));
    if (wanted) {
        Fault fault;
        const std::optional<wxString> language = FindLanguage(*wanted, fault);
        if (!language)
            return fault;
        translations->SetLanguage(*language);
    }
    translations->AddCatalog(CatalogueDomain);
    return std::nullopt;
}
