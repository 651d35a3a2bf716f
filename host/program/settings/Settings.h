#pragma once

#include "host/program/base/Fault.h"

#include <wx/xml/xml.h>

#include <filesystem>
#include <memory>
#include <optional>
#include <string>

/// Settings as XML with an element "UI" in it, which filters read: those of a run, or a file's.
class Settings {
public:
    /// No settings yet.
    Settings();

    /// Reads a settings file, which must hold an element "UI" anywhere.
    /// @param fault receives why there is no result, naming line numbers of the file
    static std::optional<Settings> Load(const std::filesystem::path& file, Fault& fault);

    /// Reads a settings file with its comments and its layout. Where the file, or the element "UI"
    /// in it, is missing, there are no settings yet; the folder must be there.
    /// @param fault receives why there is no result, as above
    static std::optional<Settings> LoadForEditing(const std::filesystem::path& file, Fault& fault);

    /// Reads what Xml gave.
    static std::optional<Settings> FromXml(const std::string& bytes, Fault& fault);

    /// The whole document in UTF-8.
    std::string Xml() const;

    /// @return the setting's value; empty when there is none
    wxString Value(const wxString& key) const;

    /// Sets a value in place of all that the key has.
    void Set(const wxString& key, const wxString& value);

    /// The node below which "UI" lies. Valid as long as the settings.
    const wxXmlNode& Node() const { return *m_document->GetDocumentNode(); }

private:
    Settings(std::unique_ptr<wxXmlDocument> document, bool keepsLayout);

    static std::optional<Settings> Parse(const std::string& bytes, bool keepLayout, Fault& fault);
    void MakeUi();
    void Append(wxXmlNode* setting);

    std::unique_ptr<wxXmlDocument> m_document;
    bool m_keepsLayout = false; ///< the document has the file's white space
    wxXmlNode* m_ui;            ///< of the document; null when it has none
};
