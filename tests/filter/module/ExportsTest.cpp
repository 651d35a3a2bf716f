#include "tests/filter/module/FilterModule.h"

#include <objbase.h>

#include <wx/translation.h>

#include <gtest/gtest.h>

namespace {

bool IsComInitialised() {
    const CLSID unknown{0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};
    void* object = nullptr;
    return CoCreateInstance(unknown, nullptr, CLSCTX_INPROC_SERVER, IID_IUnknown, &object) !=
           CO_E_NOTINITIALIZED;
}

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

TEST(Exports, DescribeTheFilter) {
    const FilterModule module;
    PluginInfo info;
    info.vendor = "someone else";
    module.GetPluginInfo(&info);
    module.GetPluginInfo(&info);
    EXPECT_EQ(2, info.kind);
    EXPECT_EQ("1.0.0.1", info.version);
    EXPECT_EQ("ORV.MSOffice.1", info.identifier);
    EXPECT_EQ("Microsoft", info.vendor);
    EXPECT_EQ("doc xls ppt pps pub doc xls ppt pps pub", wxJoin(info.extensions, ' '));
}

TEST(Exports, GiveIndependentObjects) {
    const FilterModule module;
    WQPlugin* one = module.GetPluginInstance(nullptr);
    WQPlugin* other = module.GetPluginInstance(&one);
    ASSERT_TRUE(one && other && one != other);

    wxArrayString refused;
    wxArrayString spare;
    OwnedItems items;
    wxArrayString files;
    files.Add("a.txt");
    EXPECT_EQ(-1005, one->ScreenFiles(files, spare, refused, items));
    EXPECT_EQ(0, other->ScreenFiles(wxArrayString(), spare, refused, items));
    EXPECT_EQ(-1005, one->ScreenFiles(wxArrayString(), spare, refused, items));

    module.ReleasePluginInstance(one);
    module.ReleasePluginInstance(other);
    module.ReleasePluginInstance(nullptr);
}

TEST(PluginObject, AnswersWhoItIsBeforeItIsInitialised) {
    const PluginUnderTest plugin;
    wxString version;
    wxString vendor;
    wxString identifier;
    plugin->GetVersion(version);
    plugin->GetVendor(vendor);
    plugin->GetIdentifier(identifier);
    EXPECT_EQ("1.0.0.1 Microsoft ORV.MSOffice.1", version + " " + vendor + " " + identifier);
    EXPECT_EQ(2, plugin->GetPluginKind());
    EXPECT_EQ(0, plugin->GetAuxiliaryCode());
    EXPECT_FALSE(plugin->QueryAuxiliaryFlag());

    wxArrayString first;
    wxArrayString second;
    first.Add("old");
    plugin->GetFlagLists(first, second);
    plugin->GetFlagLists(first, second);
    EXPECT_EQ("1 1 old", wxJoin(first, ' '));
    EXPECT_EQ("0 0", wxJoin(second, ' '));
}

struct CodeText {
    int code;
    const char* text;
};

const CodeText CodeTexts[] = {
    {0, "No Error"},
    {-1, "Error"},
    {-1002, "Input file not found"},
    {-1003, "Filter conversion failed"},
    {-1005, "Invalid input file"},
    {-1006, "Filter is not initialized"},
    {-1007, "PDF conversion failed"},
    {-1010, "Distiller is not installed"},
    {1011, "MS Office is not installed"},
    {1013, "MS Power Point is not installed"},
    {1020, "Error printing output file"},
    {1022, "Error: Expecting Correct PS Header"},
    {1032, "Error: CSL library error during conversion"},
    {-1004, "No Error"},
    {-1011, "No Error"},
    {1010, "No Error"},
    {1033, "No Error"},
    {2147483647, "No Error"},
};

TEST(PluginObject, PutsResultCodesIntoWords) {
    const PluginUnderTest plugin;
    for (const CodeText& expected : CodeTexts) {
        wxString text = "before";
        EXPECT_TRUE(plugin->GetErrorText(expected.code, text));
        EXPECT_EQ(expected.text, text) << expected.code;
    }
}

/// A catalogue with one entry, built in memory in the format of gettext's .mo files.
class OneEntryLoader : public wxTranslationsLoader {
public:
    wxMsgCatalog* LoadCatalog(const wxString& domain, const wxString& /*language*/) override {
        const std::string key = "Invalid input file";
        const std::string translation = "Ung\xc3\xbcltige Eingabedatei";
        const std::string header = "Content-Type: text/plain; charset=UTF-8\n";
        std::string data;
        const auto number = [&data](std::size_t value) {
            for (int shift = 0; shift < 32; shift += 8)
                data += static_cast<char>(value >> shift & 0xff);
        };
        const std::size_t texts = 28 + 4 * 8;
        for (const std::size_t value :
             {std::size_t{0x950412de}, std::size_t{0}, std::size_t{2}, std::size_t{28},
              std::size_t{44}, std::size_t{0}, std::size_t{60}})
            number(value);
        number(0), number(texts);
        number(key.size()), number(texts + 1);
        number(header.size()), number(texts + 1 + key.size() + 1);
        number(translation.size()), number(texts + 1 + key.size() + 1 + header.size() + 1);
        data += '\0' + key + '\0' + header + '\0' + translation + '\0';
        return wxMsgCatalog::CreateFromData(
            wxScopedCharBuffer::CreateNonOwned(data.data(), data.size()), domain);
    }
    wxArrayString GetAvailableTranslations(const wxString& /*domain*/) const override {
        wxArrayString languages;
        languages.Add("de");
        return languages;
    }
};

TEST(PluginObject, SpeaksTheHostsLanguageWhereTheCatalogueDoes) {
    auto* translations = new wxTranslations; // belongs to wxWidgets from here on
    wxTranslations::Set(translations);
    translations->SetLoader(new OneEntryLoader);
    translations->SetLanguage("de");
    ASSERT_TRUE(translations->AddCatalog("test"));

    const PluginUnderTest plugin;
    wxString text;
    plugin->GetErrorText(-1005, text);
    EXPECT_EQ(wxString::FromUTF8("Ung\xc3\xbcltige Eingabedatei"), text);
    plugin->GetErrorText(-1002, text);
    EXPECT_EQ("Input file not found", text);
    wxTranslations::Set(nullptr);
}

} // namespace
