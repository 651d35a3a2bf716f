#pragma once

#include <wx/translation.h>

/// Gives a wxTranslations the catalogues of a folder that holds
/// <language>/LC_MESSAGES/<domain>.mo. A broken one is not used; the log says so.
class CatalogueLoader : public wxTranslationsLoader {
public:
    /// @param folder one that is missing has no languages
    explicit CatalogueLoader(const wxString& folder) : m_folder(folder) {}

    wxMsgCatalog* LoadCatalog(const wxString& domain, const wxString& language) override;

    /// The languages' names, sorted.
    wxArrayString GetAvailableTranslations(const wxString& domain) const override;

    /// The folder beside the program.
    static wxString ProgramFolder();

private:
    wxString PathOf(const wxString& domain, const wxString& language) const;

    wxString m_folder;
};

/// The domain of the host's texts and its filters'.
constexpr const char* CatalogueDomain = "quillon";
