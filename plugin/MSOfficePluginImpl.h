#pragma once

#include "common/CatchAll.h"
#include "plugin/interface/ResultCodes.h"
#include "plugin/interface/WQPlugin.h"
#include "plugin/settings/PowerPointOptions.h"
#include "plugin/settings/SettingsMap.h"

#include <wx/weakref.h>

class MSOfficePanel;
class wxFileName;

/// The filter as the host drives it. One object holds the settings and the findings of one use;
/// objects share nothing.
///
/// The operations stand in four files: this class's own (identity, initialisation), and
/// MSOfficePluginSettings, MSOfficePluginScreening and MSOfficePluginConversion.
class MSOfficePluginImpl : public WQPlugin {
public:
    MSOfficePluginImpl();
    ~MSOfficePluginImpl() override;
    MSOfficePluginImpl(const MSOfficePluginImpl&) = delete;
    MSOfficePluginImpl& operator=(const MSOfficePluginImpl&) = delete;

    int Initialize(const wxString& serverInfo) override;
    int ApplySettings(const wxXmlNode* settings) override;
    void GetVersion(wxString& text) override;
    void GetVendor(wxString& text) override;
    void GetIdentifier(wxString& text) override;
    void GetFlagLists(wxArrayString& first, wxArrayString& second) override;
    int GetPluginKind() override;
    wxWindow* CreateSettingsPanel(wxWindow* parent) override;
    bool GetErrorText(int code, wxString& text) override;
    int ScreenFiles(const wxArrayString& files, wxArrayString& spare, wxArrayString& refused,
                    JobItemArray& items) override;
    int ScreenFolder(const wxString& folder, wxArrayString& refused, JobItemArray& items) override;
    int ScreenFileList(const wxString& folder, wxArrayString& refused, JobItemArray& items,
                       wxArrayString** files) override;
    int Convert(void* reserved, const JobItem& item, const wxString& outputFolder,
                wxString& outputName, ProgressSink* progress) override;
    int SaveSettings(wxXmlNode* parent) override;
    int LoadSettings(const wxXmlNode* settings) override;
    bool IsReady() override;
    int GetAuxiliaryCode() override;

    /// Whether a document can be converted now: Office is installed and a printer known.
    virtual bool CanConvert();

private:
    enum class Screening { GoOn, Stop };

    /// Runs the body of an operation that answers a result code. That code is the object's last
    /// result from then on, also where the body throws.
    template <typename Body>
    int RunOperation(ResultCode codeOfException, Body&& body) noexcept {
        return m_lastResult = CatchAll(codeOfException, std::forward<Body>(body));
    }

    void FindPrinter();
    Screening ScreenFile(const wxString& path, wxArrayString& refused, JobItemArray& items);
    void Accept(const wxFileName& document, JobItemArray& items);
    ResultCode PrintDocument(const wxFileName& document, const wxString& outputFolder,
                             wxString& outputName, ProgressSink* progress);
    ResultCode DistillDocument(const wxFileName& document, const wxString& outputFolder,
                               wxString& outputName);

    bool m_printerAvailable = true;
    bool m_currentServer = false;
    bool m_psOutput = false;
    ResultCode m_lastResult = Result::Success;
    wxString m_printerName;
    wxString m_distillerProfile;
    SettingsMap m_settings{100};
    PowerPointOptions m_powerPointOptions;
    /// The panel made last. The host's window owns it, and may have destroyed it.
    wxWeakRef<MSOfficePanel> m_panel;
};
