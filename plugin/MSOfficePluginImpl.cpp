#include "plugin/MSOfficePluginImpl.h"

#include "common/ServerInformation.h"
#include "machine/InstalledOffice.h"
#include "plugin/PluginIdentity.h"
#include "pstools/PrinterDiscovery.h"
#include "ui/MSOfficePanel.h"
#include "ui/MSOfficePanelBuilder.h"

namespace {

constexpr std::int32_t CurrentServerVersion = 16;
constexpr char InputTypes[] = ".doc, .docx, .xls, .xlsx, .ppt, .pptx, .pps, .ppsx, .pub";

} // namespace

MSOfficePluginImpl::MSOfficePluginImpl() = default;
MSOfficePluginImpl::~MSOfficePluginImpl() = default;

int MSOfficePluginImpl::Initialize(const wxString& serverInfo) {
    return RunOperation(Result::Failure, [&] {
        m_currentServer = ServerVersionAtLeast(serverInfo, CurrentServerVersion);
        FindPrinter();
        return Result::Success;
    });
}

void MSOfficePluginImpl::FindPrinter() {
    m_printerAvailable = FindDistillerPrinter(m_printerName);
    if (m_printerAvailable)
        return;
    wxArrayString printers;
    ListPostScriptPrinters(printers);
    m_printerAvailable = !printers.empty();
    if (m_printerAvailable)
        m_printerName = printers[0];
}

bool MSOfficePluginImpl::IsReady() {
    return CatchAll(false, [&] { return IsOfficeInstalled() && m_printerAvailable; });
}

bool MSOfficePluginImpl::CanConvert() {
    return IsReady();
}

void MSOfficePluginImpl::GetVersion(wxString& text) {
    CatchAll([&] { text = PluginIdentity::Version; });
}

void MSOfficePluginImpl::GetVendor(wxString& text) {
    CatchAll([&] { text = PluginIdentity::Vendor; });
}

void MSOfficePluginImpl::GetIdentifier(wxString& text) {
    CatchAll([&] { text = PluginIdentity::Identifier; });
}

void MSOfficePluginImpl::GetFlagLists(wxArrayString& first, wxArrayString& second) {
    CatchAll([&] {
        first.Insert("1", 0);
        second.Insert("0", 0);
    });
}

int MSOfficePluginImpl::GetPluginKind() {
    return PluginIdentity::Kind;
}

int MSOfficePluginImpl::GetAuxiliaryCode() {
    return 0;
}

bool MSOfficePluginImpl::GetErrorText(int code, wxString& text) {
    CatchAll([&] { text = GetResultText(code); });
    return true;
}

wxWindow* MSOfficePluginImpl::CreateSettingsPanel(wxWindow* parent) {
    return CatchAll<wxWindow*>(nullptr, [&] {
        const bool officeInstalled = IsOfficeInstalled();
        const bool enabled = officeInstalled && (m_currentServer || m_printerAvailable);
        m_panel = BuildMSOfficePanel(parent, PluginIdentity::Vendor, InputTypes, enabled,
                                     officeInstalled);
        if (m_panel)
            m_panel->ReadSettings(m_settings);
        return m_panel.get();
    });
}
