#pragma once

#include "common/LoadedModule.h"
#include "plugin/interface/WQPlugin.h"

#include <wx/xml/xml.h>

/// The built filter module, loaded as the host loads it.
class FilterModule {
    LoadedModule m_module;

public:
    FilterModule();

    decltype(&::InitializePlugin) InitializePlugin;
    decltype(&::GetPluginInfo) GetPluginInfo;
    decltype(&::GetPluginInstance) GetPluginInstance;
    decltype(&::ReleasePluginInstance) ReleasePluginInstance;
    decltype(&::UninitializePlugin) UninitializePlugin;
};

/// A plug-in object from the initialised module.
class PluginUnderTest {
public:
    PluginUnderTest()
        : m_plugin((m_module.InitializePlugin(), m_module.GetPluginInstance(nullptr))) {}
    ~PluginUnderTest() {
        m_module.ReleasePluginInstance(m_plugin);
        m_module.UninitializePlugin();
    }
    PluginUnderTest(const PluginUnderTest&) = delete;
    PluginUnderTest& operator=(const PluginUnderTest&) = delete;

    WQPlugin* operator->() const { return m_plugin; }

private:
    FilterModule m_module;
    WQPlugin* m_plugin;
};

/// An XML document from its text, UTF-8.
class XmlText : public wxXmlDocument {
public:
    explicit XmlText(const std::string& text);
};

/// A document as screening hands it to the conversion.
JobItem ItemFor(const wxString& path);
