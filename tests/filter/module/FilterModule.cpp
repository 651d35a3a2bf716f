#include "tests/filter/module/FilterModule.h"

#include <wx/filename.h>
#include <wx/sstream.h>

#include <gtest/gtest.h>

#define FIND_EXPORT(name) name = m_module.Find<decltype(::name)>(#name)

FilterModule::FilterModule() : m_module(wxString::FromUTF8(FILTER_MODULE)) {
    EXPECT_TRUE(m_module) << "error " << GetLastError();
    FIND_EXPORT(InitializePlugin);
    FIND_EXPORT(GetPluginInfo);
    FIND_EXPORT(GetPluginInstance);
    FIND_EXPORT(ReleasePluginInstance);
    FIND_EXPORT(UninitializePlugin);
}

XmlText::XmlText(const std::string& text) {
    wxStringInputStream stream(wxString::FromUTF8(text));
    EXPECT_TRUE(Load(stream, "UTF-8"));
}

JobItem ItemFor(const wxString& path) {
    JobItem item;
    item.fileName = wxFileName(path).GetFullName();
    item.paths.Add(path);
    return item;
}
