// A filter for tests of the host: each document says itself what is to become of it, in lines
// "screen=CODE", "convert=CODE", and so on. An output holds what the filter was told. Every call
// is noted in the host's log.

#include "common/WQServices.h"
#include "plugin/interface/WQPlugin.h"
#include "tests/host/System.h"

#include <windows.h>

#include <wx/file.h>
#include <wx/filename.h>
#include <wx/msw/registry.h>
#include <wx/tokenzr.h>
#include <wx/utils.h>
#include <wx/xml/xml.h>

#include <cstdlib>
#include <map>

namespace {

using Script = std::map<wxString, wxString>;

void Note(const wxString& call) {
    SetLevelAndGetLogger(LevelInformation, __FILE__, "ScriptedFilter", __LINE__) << call;
}

Script ReadScript(const wxString& path) {
    wxString text;
    wxFile file(path);
    if (file.IsOpened())
        file.ReadAll(&text, wxConvISO8859_1);
    Script script;
    for (const wxString& line : wxStringTokenize(text, "\n"))
        script[line.BeforeFirst('=')] = line.AfterFirst('=');
    return script;
}

int Number(const Script& script, const wxString& name) {
    const auto found = script.find(name);
    return found == script.end() ? 0 : wxAtoi(found->second);
}

/// Whether what the script asks for happens: with a line "once=FILE", only as long as there is no
/// such file, which is there then.
bool IsDue(Script& script) {
    const wxString file = script["once"];
    const bool due = file.empty() || !wxFileExists(file);
    if (due && !file.empty())
        wxFile(file, wxFile::write);
    return due;
}

/// Leaves word of a failure as an engine does.
void LeaveFailure(Script& script) {
    if (script["fault"].empty())
        return;
    wxRegKey key(wxRegKey::HKCU, "SOFTWARE\\Orvanta\\Stand-Ins\\Last Failure");
    key.Create();
    key.SetValue("Fault", script["fault"]);
    key.SetValue("Reason", script["reason"]);
}

/// Leaves word of fonts as the stand-ins do: with a line "fonts=ASKED>USED>metric;ASKED>USED>".
void LeaveFonts(Script& script) {
    if (script["fonts"].empty())
        return;
    wxString fonts = script["fonts"] + ';';
    fonts.Replace(">", "\t");
    fonts.Replace(";", "\n");
    wxRegKey key(wxRegKey::HKCU, "SOFTWARE\\Orvanta\\Stand-Ins\\Last Fonts");
    key.Create();
    key.SetValue("Fonts", fonts);
}

int Fail(Script& script, const wxString& operation) {
    const int code = Number(script, operation);
    if (code == 0 || !IsDue(script))
        return 0;
    LeaveFailure(script);
    return code;
}

/// A node's children come before anything deeper.
const wxXmlNode* FindUi(const wxXmlNode* parent) {
    for (const wxXmlNode* child = parent->GetChildren(); child; child = child->GetNext())
        if (child->GetName() == "UI")
            return child;
    for (const wxXmlNode* child = parent->GetChildren(); child; child = child->GetNext())
        if (const wxXmlNode* const found = FindUi(child))
            return found;
    return nullptr;
}

class ScriptedFilter : public WQPlugin {
public:
    int Initialize(const wxString& serverInfo) override {
        Note("Initialize");
        m_server = serverInfo + '\n';
        return 0;
    }

    int ApplySettings(const wxXmlNode* settings) override {
        Note("ApplySettings");
        const wxXmlNode* const ui = FindUi(settings);
        m_settings.clear();
        for (const wxXmlNode* setting = ui->GetChildren(); setting; setting = setting->GetNext())
            m_settings << setting->GetName() << '=' << setting->GetNodeContent() << '\n';
        return 0;
    }

    int LoadSettings(const wxXmlNode*) override { return 0; }
    int SaveSettings(wxXmlNode*) override { return 0; }
    void GetVersion(wxString& text) override { text = "7.0"; }
    void GetVendor(wxString& text) override { text = "Tests"; }
    void GetIdentifier(wxString& text) override { text = "Scripted"; }
    void GetFlagLists(wxArrayString&, wxArrayString&) override {}
    int GetPluginKind() override { return 2; }
    wxWindow* CreateSettingsPanel(wxWindow*) override { return nullptr; }
    int GetAuxiliaryCode() override { return 0; }

    bool GetErrorText(int code, wxString& text) override {
        text = wxString::Format("text of %d", code);
        return true;
    }

    int ScreenFiles(const wxArrayString& files, wxArrayString&, wxArrayString&,
                    JobItemArray& items) override {
        int code = 0;
        for (const wxString& file : files) {
            Note("Screen " + wxFileName(file).GetFullName());
            Script script = ReadScript(file);
            code = Fail(script, "screen");
            if (code == 0)
                items.Add(ItemFor(file).release());
        }
        return code;
    }

    int ScreenFolder(const wxString&, wxArrayString&, JobItemArray&) override { return -1; }
    int ScreenFileList(const wxString&, wxArrayString&, JobItemArray&, wxArrayString**) override {
        return -1;
    }

    int Convert(void*, const JobItem& item, const wxString& outputFolder, wxString& outputName,
                ProgressSink* progress) override {
        Note("Convert " + item.fileName);
        Script script = ReadScript(item.paths[0]);
        outputName = wxFileName(item.fileName).GetName() + ".ps";
        progress->Report("Printing", 50);
        if (!script["started"].empty())
            wxFile(script["started"], wxFile::write);
        while (!script["wait"].empty() && !wxFileExists(script["wait"]))
            wxMilliSleep(5);
        if (!script["crash"].empty())
            std::abort();
        if (!script["stop"].empty())
            System::StopThisProcess();
        if (!script["end"].empty() && IsDue(script))
            System::EndThisProcess();
        if (script["output"] != "none")
            wxFile(outputFolder + '/' + outputName, wxFile::write).Write(m_server + m_settings);
        if (script["output"] == "pdf" && m_settings.Contains("OUTPUTFILETYPEPS=0")) {
            outputName = wxFileName(item.fileName).GetName() + ".pdf";
            wxFile(outputFolder + '/' + outputName, wxFile::write).Write("%PDF");
        }
        if (!script["companion"].empty()) // beside the output, as PostScript stays beside PDF
            wxFile(outputFolder + '/' + wxFileName(outputName).GetName() + script["companion"],
                   wxFile::write);
        LeaveFonts(script);
        return Fail(script, "convert");
    }

    bool IsReady() override { return !wxGetEnv("SCRIPTED_FILTER_UNREADY", nullptr); }

private:
    static std::unique_ptr<JobItem> ItemFor(const wxString& path) {
        auto item = std::make_unique<JobItem>();
        item->pluginIdentifier = "Scripted";
        item->fileName = wxFileName(path).GetFullName();
        item->paths.Add(path);
        return item;
    }

    wxString m_server; ///< what it was told of it
    wxString m_settings;
};

} // namespace

void InitializePlugin() {
    Note("InitializePlugin");
}

void GetPluginInfo(PluginInfo* info) {
    Note("GetPluginInfo");
    info->kind = 2;
    info->identifier = "Scripted";
    info->vendor = "Tests";
    info->version = "7.0";
    info->extensions.Add("doc");
    info->extensions.Add("xls");
    info->extensions.Add("pub");
}

WQPlugin* GetPluginInstance(void*) {
    Note("GetPluginInstance");
    return new ScriptedFilter;
}

void ReleasePluginInstance(WQPlugin* plugin) {
    Note("ReleasePluginInstance");
    delete plugin;
}

void UninitializePlugin() {
    Note("UninitializePlugin");
}
