#include "common/WQServices.h"
#include "host/services/CatalogueLoader.h"

#include <memory>
#include <vector>

struct WQTranslations::Catalogues {
    std::vector<std::unique_ptr<wxTranslations>> languages;
};

WQTranslations::WQTranslations() : m_catalogues(std::make_unique<Catalogues>()) {
    ReadFolder(CatalogueLoader::ProgramFolder());
}

WQTranslations::~WQTranslations() = default;

WQTranslations& WQTranslations::GetInstance() {
    static WQTranslations s_instance;
    return s_instance;
}

void WQTranslations::ReadFolder(const wxString& folder) {
    m_catalogues->languages.clear();
    for (const wxString& name : CatalogueLoader(folder).GetAvailableTranslations(CatalogueDomain)) {
        auto language = std::make_unique<wxTranslations>();
        language->SetLoader(new CatalogueLoader(folder)); // owned by it
        language->SetLanguage(name);
        if (language->AddCatalog(CatalogueDomain))
            m_catalogues->languages.push_back(std::move(language));
    }
}

wxArrayString WQTranslations::GetTranslations(const wxString& key) const {
    wxArrayString texts;
    texts.Add(key);
    if (key.empty()) // that is where a catalogue keeps its header
        return texts;
    for (const auto& language : m_catalogues->languages) {
        const wxString* text = language->GetTranslatedString(key);
        if (text && !text->empty() && texts.Index(*text) == wxNOT_FOUND)
            texts.Add(*text);
    }
    return texts;
}
