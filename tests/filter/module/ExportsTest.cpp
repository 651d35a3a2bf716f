#include "tests/filter/ComOnThisThread.h"
#include "tests/filter/module/FilterModule.h"

namespace {

TEST(Exports, InitialiseOnceAndAgainAfterBeingUndone) {
    const FilterModule module;
    module.UninitializePlugin();
    EXPECT_FALSE(IsComInitialised());
    for (int round = 0; round < 2; ++round) {
        module.InitializePlugin();
        module.InitializePlugin();
        EXPECT_TRUE(IsComInitialised());
        module.UninitializePlugin();
        EXPECT_FALSE(IsComInitialised());
    }
}

TEST(Exports, DescribeTheFilterAsItsObjectsDo) {
    const FilterModule module;
    PluginInfo info;
    info.vendor = "someone else";
    info.extensions.Add("old");
    module.GetPluginInfo(&info);
    EXPECT_EQ(2, info.kind);
    EXPECT_EQ("1.0.0.1", info.version);
    EXPECT_EQ("ORV.MSOffice.1", info.identifier);
    EXPECT_EQ("Microsoft", info.vendor);
    EXPECT_EQ("old doc xls ppt pps pub", wxJoin(info.extensions, ' '));

    const PluginUnderTest plugin;
    wxString version;
    wxString vendor;
    wxString identifier;
    plugin->GetVersion(version);
    plugin->GetVendor(vendor);
    plugin->GetIdentifier(identifier);
    EXPECT_EQ(info.version + info.vendor + info.identifier, version + vendor + identifier);
    EXPECT_EQ(info.kind, plugin->GetPluginKind());
    EXPECT_EQ(0, plugin->GetAuxiliaryCode());
    EXPECT_FALSE(plugin->QueryAuxiliaryFlag());
    const wxString old = "old";
    wxArrayString first(1, &old);
    wxArrayString second;
    plugin->GetFlagLists(first, second);
    EXPECT_EQ("1 old", wxJoin(first, ' '));
    EXPECT_EQ("0", wxJoin(second, ' '));
}

TEST(Exports, GiveIndependentObjects) {
    const FilterModule module;
    WQPlugin* one = module.GetPluginInstance(nullptr);
    WQPlugin* other = module.GetPluginInstance(&one);
    ASSERT_TRUE(one && other && one != other);
    wxString outputName;
    EXPECT_EQ(-1002, one->Convert(nullptr, JobItem(), "", outputName, nullptr));
    wxArrayString spare;
    wxArrayString refused;
    JobItemArray items; // a run without files has the result of the object's last operation
    EXPECT_EQ(0, other->ScreenFiles(wxArrayString(), spare, refused, items));
    EXPECT_EQ(-1002, one->ScreenFiles(wxArrayString(), spare, refused, items));
    module.ReleasePluginInstance(one);
    module.ReleasePluginInstance(other);
    module.ReleasePluginInstance(nullptr);
}

TEST(PluginObject, PutsAnyNumberIntoWords) {
    const std::pair<int, const char*> cases[] = {
        {-1005, "Invalid input file"},
        {1013, "MS Power Point is not installed"},
        {0, "No Error"},
        {-1004, "No Error"},
        {2147483647, "No Error"},
    };
    const PluginUnderTest plugin;
    for (const auto& [code, expected] : cases) {
        wxString text = "before";
        EXPECT_TRUE(plugin->GetErrorText(code, text));
        EXPECT_EQ(expected, text) << code;
    }
}

} // namespace
