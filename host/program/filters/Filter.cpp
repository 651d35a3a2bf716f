#include "host/program/filters/Filter.h"

#include "common/WQServices.h"
#include "machine/OfficeApplication.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/xml/xml.h>

namespace {

constexpr int ServerVersion = 16;

/// The XML text in which the host describes the print server that it submits to, as filters expect
/// it at their initialisation.
wxString DescribeServer() {
    return wxString::Format("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                            "<ServerInformation>\n"
                            "  <ServerName>Marlo</ServerName>\n"
                            "  <ServerVersion>%d</ServerVersion>\n"
                            "</ServerInformation>\n",
                            ServerVersion);
}

} // namespace

std::unique_ptr<Filter> Filter::Start(std::unique_ptr<FilterModule> module) {
    PluginInfo info = module->Describe();
    WQPlugin* const plugin = module->NewInstance();
    if (!plugin) {
        SetLevelAndGetLogger(LevelError, __FILE__, __func__, __LINE__)
            << "The filter " << info.identifier << " could not make a plug-in object";
        return nullptr;
    }
    return std::unique_ptr<Filter>(new Filter(std::move(module), plugin, std::move(info)));
}

Filter::Filter(std::unique_ptr<FilterModule> module, WQPlugin* plugin, PluginInfo info)
    : m_module(std::move(module)), m_plugin(plugin), m_info(std::move(info)) {
    m_plugin->Initialize(DescribeServer());
}

Filter::~Filter() {
    m_module->ReleaseInstance(m_plugin);
}

wxArrayString Filter::Extensions() const {
    wxArrayString extensions;
    for (const wxString& listed : m_info.extensions) {
        extensions.Add(listed);
        if (IsOpenXmlExtension(listed + 'x'))
            extensions.Add(listed + 'x');
    }
    return extensions;
}

bool Filter::Claims(const wxString& extension) const {
    return Extensions().Index(extension, false) != wxNOT_FOUND;
}

wxString Filter::Unreadiness() const {
    return IsReady() ? wxString() : ErrorText(Result::NotInitialized);
}

wxWindow* Filter::CreatePanel(wxWindow* parent, const wxXmlNode& settings) {
    m_plugin->LoadSettings(&settings);
    return m_plugin->CreateSettingsPanel(parent);
}

std::map<wxString, wxString> Filter::PanelValues() {
    wxXmlNode parent(wxXML_ELEMENT_NODE, "Settings");
    m_plugin->SaveSettings(&parent);
    std::map<wxString, wxString> values;
    for (const wxXmlNode* ui = parent.GetChildren(); ui; ui = ui->GetNext())
        for (const wxXmlNode* setting = ui->GetChildren(); setting; setting = setting->GetNext())
            values[setting->GetName()] = setting->GetNodeContent();
    return values;
}

Filter::Screened Filter::Screen(const wxString& path) {
    wxArrayString files;
    files.Add(path);
    wxArrayString spare;
    wxArrayString refused;
    JobItemArray items;
    Screened screened;
    screened.code = m_plugin->ScreenFiles(files, spare, refused, items);
    for (JobItem* item : items) { // one at most, for one file
        std::unique_ptr<JobItem> owned(item);
        if (!screened.item)
            screened.item = std::move(owned);
    }
    if (screened.code != Result::Success)
        screened.item.reset();
    else if (!screened.item)
        screened.code = Result::Failure;
    return screened;
}

int Filter::Convert(const JobItem& item, const wxString& folder, wxString& outputName,
                    ProgressSink& progress) {
    return m_plugin->Convert(nullptr, item, folder, outputName, &progress);
}

wxString Filter::ErrorText(int code) const {
    wxString text;
    m_plugin->GetErrorText(code, text);
    return text;
}
