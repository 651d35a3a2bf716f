#include "common/WQServices.h"
#include "host/services/CatalogueCheck.h"

#include <wx/dir.h>
#include <wx/file.h>
#include <wx/filename.h>
#include <wx/log.h>
#include <wx/stdpaths.h>
#include <wx/translation.h>

#include <memory>
#include <vector>

struct WQTranslations::Catalogues {
    std::vector<std::unique_ptr<wxTranslations>> languages;
};

namespace {

constexpr const char* Domain = "quillon";
constexpr wxFileOffset LargestCatalogue = 16 << 20;

wxString DefaultFolder() {
    return wxFileName(wxStandardPaths::Get().GetExecutablePath()).GetPathWithSep() + "locale";
}

/// @return null when the file is no catalogue; goes to a wxTranslations, which alone can delete it
wxMsgCatalog* ReadCatalogue(const wxString& path) {
    const wxLogNull quiet; // the caller says it once, and where
    wxFile file(path);
    const wxFileOffset size = file.IsOpened() ? file.Length() : wxInvalidOffset;
    if (size <= 0 || size > LargestCatalogue)
        return nullptr;
    wxCharBuffer bytes(static_cast<std::size_t>(size));
    if (file.Read(bytes.data(), bytes.length()) != size ||
        !IsSoundCatalogue({bytes.data(), bytes.length()}))
        return nullptr;
    return wxMsgCatalog::CreateFromData(bytes, Domain);
}

/// Gives a wxTranslations one file, whatever language it asks for.
class OneFile : public wxTranslationsLoader {
public:
    explicit OneFile(const wxString& path) : m_path(path) {}

    wxMsgCatalog* LoadCatalog(const wxString& /*domain*/, const wxString& /*language*/) override {
        return ReadCatalogue(m_path);
    }

    wxArrayString GetAvailableTranslations(const wxString& /*domain*/) const override { return {}; }

private:
    wxString m_path;
};

/// @return null when the file is no catalogue; the log then says so
std::unique_ptr<wxTranslations> LoadLanguage(const wxString& path) {
    auto language = std::make_unique<wxTranslations>();
    language->SetLoader(new OneFile(path)); // owned by it
    language->SetLanguage("x");             // its name does not matter to a loader of one file
    if (language->AddCatalog(Domain))
        return language;
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "The translation catalogue " << path << " is broken and not used.";
    return nullptr;
}

wxArrayString LanguagesIn(const wxString& folder) {
    wxArrayString languages;
    wxDir directory;
    wxString language;
    if (wxDirExists(folder) && directory.Open(folder))
        for (bool more = directory.GetFirst(&language, wxEmptyString, wxDIR_DIRS); more;
             more = directory.GetNext(&language))
            languages.Add(language);
    languages.Sort();
    return languages;
}

} // namespace

WQTranslations::WQTranslations() : m_catalogues(std::make_unique<Catalogues>()) {
    ReadFolder(DefaultFolder());
}

WQTranslations::~WQTranslations() = default;

WQTranslations& WQTranslations::GetInstance() {
    static WQTranslations s_instance;
    return s_instance;
}

void WQTranslations::ReadFolder(const wxString& folder) {
    m_catalogues->languages.clear();
    for (const wxString& language : LanguagesIn(folder)) {
        const wxString path = folder + wxFileName::GetPathSeparator() + language +
                              wxFileName::GetPathSeparator() + "LC_MESSAGES" +
                              wxFileName::GetPathSeparator() + "quillon.mo";
        if (!wxFileExists(path))
            continue;
        if (auto loaded = LoadLanguage(path))
            m_catalogues->languages.push_back(std::move(loaded));
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
