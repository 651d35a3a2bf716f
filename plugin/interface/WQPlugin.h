#pragma once

#include "plugin/interface/JobItem.h"
#include "plugin/interface/PluginInfo.h"
#include "plugin/interface/ProgressSink.h"

#include <wx/arrstr.h>
#include <wx/string.h>

class wxWindow;
class wxXmlNode;

/// What the host drives a filter through. The order of the operations is the order of their slots
/// and so part of the binary interface: new ones go to the end.
///
/// The host calls Initialize first and ApplySettings after it (Initialize picks a printer,
/// ApplySettings the user's), then screens and converts, or builds the settings panel. It never
/// calls one object from two threads at once. No operation throws.
class WQPlugin {
public:
    virtual ~WQPlugin() = default;

    /// @param serverInfo the server information, an XML text; may be empty
    /// @return 0, or -1 where memory ran out
    virtual int Initialize(const wxString& serverInfo) = 0;

    /// Reads the element "UI" below `settings` and makes its values the ones to convert with.
    /// @return 0
    virtual int ApplySettings(const wxXmlNode* settings) = 0;

    virtual void GetVersion(wxString& text) = 0;
    virtual void GetVendor(wxString& text) = 0;
    virtual void GetIdentifier(wxString& text) = 0;
    virtual void GetFlagLists(wxArrayString& first, wxArrayString& second) = 0;
    virtual int GetPluginKind() = 0;

    /// Builds the settings panel, which then belongs to `parent`.
    /// @return the panel, or null when there is none
    virtual wxWindow* CreateSettingsPanel(wxWindow* parent) = 0;

    /// @param text receives the message of the result code
    /// @return true
    virtual bool GetErrorText(int code, wxString& text) = 0;

    /// Sorts out which of `files` the filter takes.
    /// @param files full paths
    /// @param spare is emptied
    /// @param refused refused paths are appended to it
    /// @param items accepted documents are appended to it and then belong to the caller
    /// @return the result code of the last file looked at
    virtual int ScreenFiles(const wxArrayString& files, wxArrayString& spare,
                            wxArrayString& refused, JobItemArray& items) = 0;

    /// ScreenFiles for the files directly in `folder`.
    virtual int ScreenFolder(const wxString& folder, wxArrayString& refused,
                             JobItemArray& items) = 0;

    /// ScreenFiles for a list that the host keeps; the list is not changed.
    virtual int ScreenFileList(const wxString& folder, wxArrayString& refused, JobItemArray& items,
                               wxArrayString** files) = 0;

    /// Converts one document.
    /// @param reserved not used
    /// @param outputFolder where the output goes; no separator at its end
    /// @param outputName receives the output's file name
    /// @param progress may be null
    /// @return a result code
    virtual int Convert(void* reserved, const JobItem& item, const wxString& outputFolder,
                        wxString& outputName, ProgressSink* progress) = 0;

    /// Appends the settings to `parent` as a new element "UI", the panel's values included.
    /// @return 0
    virtual int SaveSettings(wxXmlNode* parent) = 0;

    /// Reads the element "UI" below `settings` for the panel; conversions go on as before.
    /// @return 0
    virtual int LoadSettings(const wxXmlNode* settings) = 0;

    /// Whether an Office application and a PostScript printer are there to work with.
    virtual bool IsReady() = 0;

    virtual int GetAuxiliaryCode() = 0;
    virtual bool QueryAuxiliaryFlag() { return false; }
    virtual void AuxiliaryNotify() {}
};

/// What a filter module exports, undecorated.
extern "C" {

/// Initialises the module. Called once, before anything else of it, from a thread that is not in
/// COM's multithreaded apartment, as no thread may be that calls an object's operations.
void InitializePlugin();

/// Describes the filter: sets the kind and the texts of `info`, appends to its extensions.
void GetPluginInfo(PluginInfo* info);

/// @param context not used
/// @return a new object, or null when it cannot be made; goes back to ReleasePluginInstance
WQPlugin* GetPluginInstance(void* context);

/// @param plugin an object from GetPluginInstance, or null
void ReleasePluginInstance(WQPlugin* plugin);

/// Undoes InitializePlugin.
void UninitializePlugin();
}
