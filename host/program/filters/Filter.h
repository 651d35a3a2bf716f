#pragma once

#include "host/program/filters/FilterModule.h"

#include <map>
#include <memory>

/// A filter at work: one module and one plug-in object of it, initialised.
class Filter {
public:
    /// @return null when the module has no object to give; the log says so
    static std::unique_ptr<Filter> Start(std::unique_ptr<FilterModule> module);

    ~Filter();
    Filter(const Filter&) = delete;
    Filter& operator=(const Filter&) = delete;

    const PluginInfo& Info() const { return m_info; }

    /// The extensions of the files that are the filter's, without dots: those that its description
    /// lists and, behind each of an old format, that of the Office Open XML format in its place.
    wxArrayString Extensions() const;

    /// Whether files with this extension, in any case, are the filter's.
    bool Claims(const wxString& extension) const;

    bool IsReady() const { return m_plugin->IsReady(); }
    /// Why it is not ready, in its own words; empty when it is.
    wxString Unreadiness() const;

    void ApplySettings(const wxXmlNode& settings) { m_plugin->ApplySettings(&settings); }

    /// Builds the filter's settings panel.
    /// @param settings what it shows
    /// @return the panel, which belongs to `parent`; null when there is none
    wxWindow* CreatePanel(wxWindow* parent, const wxXmlNode& settings);

    /// The settings as they are in the panel, if there is one.
    std::map<wxString, wxString> PanelValues();

    struct Screened {
        int code = 0;
        std::unique_ptr<JobItem> item; ///< null when the file is not accepted
    };
    /// One file at a time: the filter tells the code of the last file of a list only, and leaves
    /// out without a word what fails its document check.
    /// @param path a full path
    Screened Screen(const wxString& path);

    /// @param folder no separator at its end
    /// @param outputName receives the output's file name
    int Convert(const JobItem& item, const wxString& folder, wxString& outputName,
                ProgressSink& progress);

    /// The message of a result code, the host's own included.
    wxString ErrorText(int code) const;

private:
    Filter(std::unique_ptr<FilterModule> module, WQPlugin* plugin, PluginInfo info);

    std::unique_ptr<FilterModule> m_module;
    WQPlugin* m_plugin;
    PluginInfo m_info;
};
