#include "common/WQServices.h"

#include <wx/dir.h>
#include <wx/file.h>
#include <wx/filename.h>
#include <wx/log.h>
#include <wx/stdpaths.h>
#include <wx/translation.h>

#include <memory>
#include <vector>

struct WQTranslations::Catalogues {
    std::vector<std::unique_ptr<wxMsgCatalog>> languages;
};

namespace {

constexpr wxFileOffset LargestCatalogue = 16 * 1024 * 1024;

wxString DefaultFolder() {
    return wxFileName(wxStandardPaths::Get().GetExecutablePath()).GetPathWithSep() + "locale";
}

/// @return null when the file is no catalogue; the log then says so
std::unique_ptr<wxMsgCatalog> ReadCatalogue(const wxString& path) {
    const wxLogNull quiet; // the record below says it once, and where
    wxFile file(path);
    const wxFileOffset size = file.IsOpened() ? file.Length() : wxInvalidOffset;
    std::unique_ptr<wxMsgCatalog> catalogue;
    if (size > 0 && size <= LargestCatalogue) {
        wxCharBuffer bytes(static_cast<std::size_t>(size));
        if (file.Read(bytes.data(), bytes.length()) == size)
            catalogue.reset(wxMsgCatalog::CreateFromData(bytes, "quillon"));
    }
    if (!catalogue)
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The translation catalogue " << path << " is broken and not used.";
    return catalogue;
}

wxArrayString LanguagesIn(const wxString& folder) {
    wxArrayString languages;
    const wxDir directory(wxDirExists(folder) ? folder : wxString());
    wxString language;
    if (directory.IsOpened())
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
        if (auto catalogue = ReadCatalogue(path))
            m_catalogues->languages.push_back(std::move(catalogue));
    }
}

wxArrayString WQTranslations::GetTranslations(const wxString& key) const {
    wxArrayString texts;
    texts.Add(key);
    if (key.empty()) // that is where a catalogue keeps its header
        return texts;
    for (const auto& catalogue : m_catalogues->languages) {
        const wxString* text = catalogue->GetString(key);
        if (text && !text->empty() && texts.Index(*text) == wxNOT_FOUND)
            texts.Add(*text);
    }
    return texts;
}
