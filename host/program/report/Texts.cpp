#include "host/program/report/Texts.h"

#include <wx/arrstr.h>
#include <wx/tokenzr.h>

namespace {

constexpr const char* English = "en"; // the texts themselves
constexpr unsigned MostWishes = 20;   // of a browser; who sends more has no such wish

/// How much a language is wanted, which stands behind it (";q=0.8").
double WeightOf(const wxString& parameter) {
    wxString number;
    double weight = 1;
    if (parameter.Strip(wxString::both).StartsWith("q=", &number) && !number.ToCDouble(&weight))
        return 0;
    return weight;
}

} // namespace

Texts::Texts(const wxString& language, const wxString& folder) : m_language(language) {
    if (language == English)
        return;
    m_translations = std::make_unique<wxTranslations>();
    m_translations->SetLoader(new CatalogueLoader(folder)); // owned by it
    m_translations->SetLanguage(language);
    m_translations->AddCatalog(CatalogueDomain);
}

wxString Texts::operator()(const char* english) const {
    const wxString* const text =
        m_translations ? m_translations->GetTranslatedString(english, CatalogueDomain) : nullptr;
    return text ? *text : wxString(english);
}

wxString Texts::Plural(const char* one, const char* many, unsigned number) const {
    const wxString* const text =
        m_translations ? m_translations->GetTranslatedString(one, number, CatalogueDomain)
                       : nullptr;
    return text ? *text : wxString(number == 1 ? one : many);
}

TextsOfLanguages::TextsOfLanguages(const wxString& folder) {
    wxArrayString languages = CatalogueLoader(folder).GetAvailableTranslations(CatalogueDomain);
    languages.Add(English);
    for (const wxString& language : languages)
        m_texts.try_emplace(language, language, folder);
    wxTranslations* const ofProgram = wxTranslations::Get();
    m_ofProgram = ofProgram ? Find(ofProgram->GetBestTranslation(CatalogueDomain)) : nullptr;
    if (!m_ofProgram)
        m_ofProgram = Find(English);
}

const Texts* TextsOfLanguages::Find(const wxString& language) const {
    wxString name = language;
    name.Replace("-", "_");
    for (const wxString& wanted : {name, name.BeforeFirst('_').Lower()})
        if (const auto found = m_texts.find(wanted); found != m_texts.end())
            return &found->second;
    return nullptr;
}

const Texts& TextsOfLanguages::Choose(const std::string& acceptLanguage) const {
    const Texts* best = m_ofProgram;
    double bestWeight = 0;
    unsigned wishes = 0;
    wxStringTokenizer wanted(wxString::FromAscii(acceptLanguage.c_str()), ",");
    while (wanted.HasMoreTokens() && ++wishes <= MostWishes) {
        const wxString wish = wanted.GetNextToken();
        const double weight = WeightOf(wish.AfterFirst(';'));
        const Texts* const texts = Find(wish.BeforeFirst(';').Strip(wxString::both));
        if (texts && weight > bestWeight) {
            best = texts;
            bestWeight = weight;
        }
    }
    return *best;
}
