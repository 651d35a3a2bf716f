#include "host/program/settings/Settings.h"

#include "host/program/base/BoundedFile.h"
#include "host/program/settings/XmlCheck.h"

#include <wx/intl.h>
#include <wx/log.h>
#include <wx/mstream.h>

namespace fs = std::filesystem;

namespace {

constexpr int DeepestNesting = 64;

bool IsElement(const wxXmlNode* node, const wxString& name) {
    return node->GetType() == wxXML_ELEMENT_NODE && node->GetName() == name;
}

/// The element "UI" that filters find: among a node's children before anything deeper.
wxXmlNode* FindUi(const wxXmlNode& parent) {
    for (wxXmlNode* child = parent.GetChildren(); child; child = child->GetNext())
        if (IsElement(child, "UI"))
            return child;
    for (wxXmlNode* child = parent.GetChildren(); child; child = child->GetNext())
        if (child->GetType() == wxXML_ELEMENT_NODE)
            if (wxXmlNode* const found = FindUi(*child))
                return found;
    return nullptr;
}

Fault Unusable(const wxString& what) {
    return {what, Blame::Usage};
}

bool IsBlank(const wxXmlNode* node) {
    return node && node->GetType() == wxXML_TEXT_NODE &&
           node->GetContent().Strip(wxString::both).empty();
}

wxXmlNode* NewText(const wxString& text) {
    return new wxXmlNode(wxXML_TEXT_NODE, "text", text); // the tree's that it goes to
}

void Remove(wxXmlNode* parent, wxXmlNode* child) {
    parent->RemoveChild(child);
    delete child;
}

void RemoveChildren(wxXmlNode* node) {
    while (wxXmlNode* const child = node->GetChildren())
        Remove(node, child);
}

/// The white space in front of a node, from its line's beginning on.
wxString SpaceBefore(const wxXmlNode* node) {
    const wxXmlNode* before = nullptr;
    for (const wxXmlNode* each = node->GetParent()->GetChildren(); each != node;
         each = each->GetNext())
        before = each;
    return IsBlank(before) ? before->GetContent() : wxString();
}

} // namespace

Settings::Settings() : m_document(std::make_unique<wxXmlDocument>()) {
    auto* const root = new wxXmlNode(wxXML_ELEMENT_NODE, "Settings"); // the document's from here on
    m_document->SetRoot(root);
    m_ui = new wxXmlNode(root, wxXML_ELEMENT_NODE, "UI");
}

Settings::Settings(std::unique_ptr<wxXmlDocument> document, bool keepsLayout)
    : m_document(std::move(document)), m_keepsLayout(keepsLayout),
      m_ui(FindUi(*m_document->GetDocumentNode())) {}

std::optional<Settings> Settings::Parse(const std::string& bytes, bool keepLayout, Fault& fault) {
    fault = Unusable(FindXmlFault(bytes, DeepestNesting));
    if (!fault.what.empty())
        return std::nullopt;
    const wxLogNull quiet; // the text has been checked, and the check's message is the better one
    wxMemoryInputStream stream(bytes.data(), bytes.size());
    auto document = std::make_unique<wxXmlDocument>();
    if (!document->Load(stream, "UTF-8",
                        keepLayout ? wxXMLDOC_KEEP_WHITESPACE_NODES : wxXMLDOC_NONE)) {
        fault = Unusable(_("its encoding is not known"));
        return std::nullopt;
    }
    return Settings(std::move(document), keepLayout);
}

std::optional<Settings> Settings::FromXml(const std::string& bytes, Fault& fault) {
    std::optional<Settings> settings = Parse(bytes, false, fault);
    if (settings && !settings->m_ui) {
        fault = Unusable(_("it has no element \"UI\" with settings in it"));
        return std::nullopt;
    }
    return settings;
}

std::optional<Settings> Settings::Load(const fs::path& file, Fault& fault) {
    const std::optional<std::string> bytes = ReadBounded(file, fault);
    return bytes ? FromXml(*bytes, fault) : std::nullopt;
}

std::optional<Settings> Settings::LoadForEditing(const fs::path& file, Fault& fault) {
    std::error_code ignored;
    if (!fs::exists(file, ignored)) {
        if (fs::is_directory(fs::absolute(file, ignored).parent_path(), ignored))
            return Settings();
        fault = Unusable(_("its folder does not exist; create that first"));
        return std::nullopt;
    }
    const std::optional<std::string> bytes = ReadBounded(file, fault);
    std::optional<Settings> settings = bytes ? Parse(*bytes, true, fault) : std::nullopt;
    if (settings)
        settings->MakeUi();
    return settings;
}

/// Makes the element "UI" the only one among its neighbours, and a blank setting an empty one, as
/// it is where white space does not count.
void Settings::MakeUi() {
    if (!m_ui)
        m_ui = new wxXmlNode(m_document->GetRoot(), wxXML_ELEMENT_NODE, "UI");
    for (wxXmlNode *other = m_ui->GetNext(), *next = nullptr; other; other = next) {
        next = other->GetNext();
        if (IsElement(other, "UI"))
            Remove(m_ui->GetParent(), other);
    }
    for (wxXmlNode* setting = m_ui->GetChildren(); setting; setting = setting->GetNext())
        if (IsBlank(setting->GetChildren()) && !setting->GetChildren()->GetNext())
            RemoveChildren(setting);
}

std::string Settings::Xml() const {
    wxMemoryOutputStream stream;
    m_document->SetFileEncoding("UTF-8");
    m_document->SetFileType(wxTextFileType_Unix);
    m_document->Save(stream, m_keepsLayout ? wxXML_NO_INDENTATION : 2);
    std::string bytes(stream.GetSize(), '\0');
    stream.CopyTo(bytes.data(), bytes.size());
    return bytes;
}

wxString Settings::Value(const wxString& key) const {
    wxString value;
    for (const wxXmlNode* setting = m_ui->GetChildren(); setting; setting = setting->GetNext())
        if (IsElement(setting, key))
            for (const wxXmlNode* part = setting->GetChildren(); part; part = part->GetNext())
                value = part->GetContent(); // the last one holds, for filters too
    return value;
}

void Settings::Set(const wxString& key, const wxString& value) {
    wxXmlNode* place = nullptr;
    for (wxXmlNode *setting = m_ui->GetChildren(), *next = nullptr; setting; setting = next) {
        next = setting->GetNext();
        if (!IsElement(setting, key))
            continue;
        if (place)
            Remove(m_ui, setting);
        else
            place = setting;
    }
    if (!place)
        Append(place = new wxXmlNode(wxXML_ELEMENT_NODE, key));
    RemoveChildren(place);
    if (!value.empty())
        place->AddChild(NewText(value));
}

/// Puts a new setting behind the others, laid out as they are.
void Settings::Append(wxXmlNode* setting) {
    wxXmlNode* last = nullptr;
    wxXmlNode* lastSetting = nullptr;
    for (wxXmlNode* child = m_ui->GetChildren(); child; child = child->GetNext()) {
        last = child;
        if (child->GetType() == wxXML_ELEMENT_NODE)
            lastSetting = child;
    }
    const wxString outer = SpaceBefore(m_ui);
    if (!m_keepsLayout) {
        m_ui->AddChild(setting);
    } else if (lastSetting) {
        const wxString space = SpaceBefore(lastSetting);
        m_ui->InsertChildAfter(setting, lastSetting);
        if (!space.empty())
            m_ui->InsertChildAfter(NewText(space), lastSetting);
    } else {
        if (!outer.empty() && !IsBlank(last))
            m_ui->AddChild(NewText(outer + "  "));
        m_ui->AddChild(setting);
        if (!outer.empty())
            m_ui->AddChild(NewText(outer));
    }
}
