#include "host/services/CatalogueLoader.h"

#include "common/WQServices.h"
#include "host/services/CatalogueCheck.h"

#include <wx/dir.h>
#include <wx/file.h>
#include <wx/filename.h>
#include <wx/log.h>
#include <wx/stdpaths.h>

namespace {

constexpr wxFileOffset LargestCatalogue = 16 << 20;

/// @return null when the file is no catalogue; goes to a wxTranslations, which alone can delete it
wxMsgCatalog* ReadCatalogue(const wxString& path, const wxString& domain) {
    const wxLogNull quiet; // the caller says it once, and where
    wxFile file(path);
    const wxFileOffset size = file.IsOpened() ? file.Length() : wxInvalidOffset;
    if (size <= 0 || size > LargestCatalogue)
        return nullptr;
    wxCharBuffer bytes(static_cast<std::size_t>(size));
    if (file.Read(bytes.data(), bytes.length()) != size ||
        !IsSoundCatalogue({bytes.data(), bytes.length()}))
        return nullptr;
    return wxMsgCatalog::CreateFromData(bytes, domain);
}

} // namespace

wxString CatalogueLoader::ProgramFolder() {
    return wxFileName(wxStandardPaths::Get().GetExecutablePath()).GetPathWithSep() + "locale";
}

wxString CatalogueLoader::PathOf(const wxString& domain, const wxString& language) const {
    const wxString separator = wxFileName::GetPathSeparator();
    return m_folder + separator + language + separator + "LC_MESSAGES" + separator + domain + ".mo";
}

wxMsgCatalog* CatalogueLoader::LoadCatalog(const wxString& domain, const wxString& language) {
    const wxString path = PathOf(domain, language);
    if (!wxFileExists(path))
        return nullptr;
    wxMsgCatalog* const catalogue = ReadCatalogue(path, domain);
    if (!catalogue)
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The translation catalogue " << path << " is broken and not used.";
    return catalogue;
}

wxArrayString CatalogueLoader::GetAvailableTranslations(const wxString& domain) const {
    wxArrayString languages;
    wxDir directory;
    wxString language;
    if (wxDirExists(m_folder) && directory.Open(m_folder))
        for (bool more = directory.GetFirst(&language, wxEmptyString, wxDIR_DIRS); more;
             more = directory.GetNext(&language))
            if (wxFileExists(PathOf(domain, language)))
                languages.Add(language);
    languages.Sort();
    return languages;
}
