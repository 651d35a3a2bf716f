#include "plugin/MSOfficePluginImpl.h"

#include "common/ServerInformation.h"
#include "office/InstalledApplications.h"
#include "plugin/Boundary.h"
#include "plugin/PluginIdentity.h"
#include "pstools/PrinterDiscovery.h"

namespace {

constexpr std::int32_t CurrentServerVersion = 16;

} // namespace

int MSOfficePluginImpl::Initialize(const wxString& serverInfo) {
    return AtBoundary(Result::Failure, [&] {
        m_currentServer = ServerVersionAtLeast(serverInfo, CurrentServerVersion);
        FindPrinter();
        return m_lastResult = Result::Success;
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
    return AtBoundary(false, [&] { return IsOfficeInstalled() && m_printerAvailable; });
}

bool MSOfficePluginImpl::CanConvert() {
    return IsReady();
}

void MSOfficePluginImpl::GetVersion(wxString& text) {
    AtBoundary([&] { text = PluginIdentity::Version; });
}

void MSOfficePluginImpl::GetVendor(wxString& text) {
    AtBoundary([&] { text = PluginIdentity::Vendor; });
}

void MSOfficePluginImpl::GetIdentifier(wxString& text) {
    AtBoundary([&] { text = PluginIdentity::Identifier; });
}

void MSOfficePluginImpl::GetFlagLists(wxArrayString& first, wxArrayString& second) {
    AtBoundary([&] {
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
    AtBoundary([&] { text = GetResultText(code); });
    return true;
}

wxWindow* MSOfficePluginImpl::CreateSettingsPanel(wxWindow* /*parent*/) {
    return nullptr; // the filter has no panel yet
}
