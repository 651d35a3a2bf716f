#pragma once

#include <wx/xml/xml.h>

#include <filesystem>
#include <memory>
#include <optional>

/// The settings of a run, as XML with an element "UI" in it, which filters read.
class Settings {
public:
    /// No settings yet.
    Settings();

    /// Reads a settings file, which must hold an element "UI" anywhere.
    /// @param fault receives why there is no result, for people, naming line numbers of the file
    static std::optional<Settings> Load(const std::filesystem::path& file, wxString& fault);

    /// @return the setting's value; empty when there is none
    wxString Value(const wxString& key) const;

    /// Sets a value in place of all that the key has.
    void Set(const wxString& key, const wxString& value);

    /// The node below which "UI" lies. Valid as long as the settings.
    const wxXmlNode& Node() const { return *m_document->GetDocumentNode(); }

private:
    explicit Settings(std::unique_ptr<wxXmlDocument> document);

    std::unique_ptr<wxXmlDocument> m_document;
    wxXmlNode* m_ui; ///< of the document; null when it has none
};
