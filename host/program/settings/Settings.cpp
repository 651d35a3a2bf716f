#include "host/program/settings/Settings.h"

#include "host/program/PathText.h"
#include "host/program/settings/XmlCheck.h"

#include <wx/log.h>
#include <wx/mstream.h>

#include <fstream>

namespace fs = std::filesystem;

namespace {

constexpr std::uintmax_t LargestFile = 1 << 20;
constexpr int DeepestNesting = 64;

/// The element "UI" that filters find: among a node's children before anything deeper.
wxXmlNode* FindUi(const wxXmlNode& parent) {
    for (wxXmlNode* child = parent.GetChildren(); child; child = child->GetNext())
        if (child->GetType() == wxXML_ELEMENT_NODE && child->GetName() == "UI")
            return child;
    for (wxXmlNode* child = parent.GetChildren(); child; child = child->GetNext())
        if (child->GetType() == wxXML_ELEMENT_NODE)
            if (wxXmlNode* const found = FindUi(*child))
                return found;
    return nullptr;
}

std::optional<std::string> ReadBounded(const fs::path& file, wxString& fault) {
    std::error_code error;
    if (!fs::is_regular_file(file, error)) {
        fault = "there is no such file";
        return std::nullopt;
    }
    const std::uintmax_t size = fs::file_size(file, error);
    if (!error && size > LargestFile) {
        fault = wxString::Format("it is larger than %ju KiB, too much for settings",
                                 LargestFile / 1024);
        return std::nullopt;
    }
    std::string bytes(error ? 0 : size, '\0');
    std::ifstream stream(file, std::ios::binary);
    if (!stream.read(bytes.data(), static_cast<std::streamsize>(bytes.size()))) {
        fault = "it cannot be read";
        return std::nullopt;
    }
    return bytes;
}

std::unique_ptr<wxXmlDocument> Parse(const std::string& bytes) {
    const wxLogNull quiet; // the text has been checked, and the check's message is the better one
    wxMemoryInputStream stream(bytes.data(), bytes.size());
    auto document = std::make_unique<wxXmlDocument>();
    return document->Load(stream) ? std::move(document) : nullptr;
}

} // namespace

Settings::Settings() : m_document(std::make_unique<wxXmlDocument>()) {
    auto* const root = new wxXmlNode(wxXML_ELEMENT_NODE, "Settings"); // the document's from here on
    m_document->SetRoot(root);
    m_ui = new wxXmlNode(root, wxXML_ELEMENT_NODE, "UI");
}

Settings::Settings(std::unique_ptr<wxXmlDocument> document)
    : m_document(std::move(document)), m_ui(FindUi(*m_document->GetDocumentNode())) {}

std::optional<Settings> Settings::Load(const fs::path& file, wxString& fault) {
    const std::optional<std::string> bytes = ReadBounded(file, fault);
    if (!bytes)
        return std::nullopt;
    fault = FindXmlFault(*bytes, DeepestNesting);
    if (!fault.empty())
        return std::nullopt;
    std::unique_ptr<wxXmlDocument> document = Parse(*bytes);
    if (!document) {
        fault = "its encoding is not known";
        return std::nullopt;
    }
    Settings settings(std::move(document));
    if (!settings.m_ui) {
        fault = "it has no element \"UI\" with settings in it";
        return std::nullopt;
    }
    return settings;
}

wxString Settings::Value(const wxString& key) const {
    wxString value;
    for (const wxXmlNode* setting = m_ui->GetChildren(); setting; setting = setting->GetNext())
        if (setting->GetType() == wxXML_ELEMENT_NODE && setting->GetName() == key)
            for (const wxXmlNode* part = setting->GetChildren(); part; part = part->GetNext())
                value = part->GetContent(); // the last one holds, for filters too
    return value;
}

void Settings::Set(const wxString& key, const wxString& value) {
    wxXmlNode* setting = m_ui->GetChildren();
    while (setting) {
        wxXmlNode* const next = setting->GetNext();
        if (setting->GetType() == wxXML_ELEMENT_NODE && setting->GetName() == key &&
            m_ui->RemoveChild(setting))
            delete setting;
        setting = next;
    }
    auto* const added = new wxXmlNode(m_ui, wxXML_ELEMENT_NODE, key);
    added->AddChild(new wxXmlNode(wxXML_TEXT_NODE, "text", value));
}
