#include "tests/filter/module/FilterModule.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/sstream.h>
#include <wx/xml/xml.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>

namespace {

class Document {
public:
    explicit Document(const char* text) {
        wxStringInputStream stream(wxString::FromUTF8(text));
        EXPECT_TRUE(m_document.Load(stream, "UTF-8"));
    }
    wxXmlNode* Root() const { return m_document.GetRoot(); }

private:
    wxXmlDocument m_document;
};

using Settings = std::map<wxString, wxString>;

/// What SaveSettings appends.
Settings Saved(const PluginUnderTest& plugin) {
    Document target("<settings><other/></settings>");
    EXPECT_EQ(0, plugin->SaveSettings(target.Root()));
    Settings settings;
    const wxXmlNode* element = target.Root()->GetChildren()->GetNext();
    if (!element || element->GetName() != "UI" || element->GetNext()) {
        ADD_FAILURE() << "no single UI element at the end";
        return settings;
    }
    for (const wxXmlNode* setting = element->GetChildren(); setting; setting = setting->GetNext()) {
        const wxXmlNode* text = setting->GetChildren();
        EXPECT_TRUE(text && text->GetType() == wxXML_TEXT_NODE && text->GetName() == "text");
        EXPECT_TRUE(settings.emplace(setting->GetName(), text->GetContent()).second);
    }
    return settings;
}

TEST(Settings, StartEmptyAndAreSavedAsAnEmptyElement) {
    const PluginUnderTest plugin;
    EXPECT_TRUE(Saved(plugin).empty());
}

TEST(Settings, AreReadFromTheElementWhereverItStands) {
    const struct {
        const char* xml;
        Settings settings;
    } cases[] = {
        {"<r/>", {}},
        {"<r><ui><A>1</A></ui></r>", {}},
        {"<r><UI/></r>", {}},
        {"<r><a><b><UI><A>1</A></UI></b></a></r>", {{"A", "1"}}},
        {"<r><UI><A>1</A><A>2</A><a>3</a></UI></r>", {{"A", "2"}, {"a", "3"}}},
        {"<r><UI>text<A/><!--A--><B>\xc3\xa4 &amp; \xd0\x96</B></UI></r>",
         {{"B", wxString::FromUTF8("\xc3\xa4 & \xd0\x96")}}},
        {"<r><UI><A>first<b/></A><C>one<!--two--></C></UI></r>", {{"A", ""}, {"C", "two"}}},
        {"<r><UI><A> 1 </A></UI><UI><A>2</A></UI></r>", {{"A", " 1 "}}},
    };
    for (const auto& one : cases) {
        const PluginUnderTest plugin;
        const Document document(one.xml);
        EXPECT_EQ(0, plugin->LoadSettings(document.Root()));
        EXPECT_EQ(one.settings, Saved(plugin)) << one.xml;
    }
}

TEST(Settings, AccumulateAndKeepWhatTheFilterDoesNotKnow) {
    const PluginUnderTest plugin;
    plugin->LoadSettings(Document("<r><UI><MINE>kept</MINE><COLOR>Color</COLOR></UI></r>").Root());
    plugin->LoadSettings(Document("<r><UI><COLOR>Grayscale</COLOR><MINE/></UI></r>").Root());
    plugin->LoadSettings(Document("<r/>").Root());
    plugin->LoadSettings(nullptr);
    EXPECT_EQ((Settings{{"MINE", "kept"}, {"COLOR", "Grayscale"}}), Saved(plugin));
}

TEST(Settings, HoldEveryKeyOnceTheyHaveBeenApplied) {
    const PluginUnderTest plugin;
    EXPECT_EQ(0, plugin->ApplySettings(Document("<r><UI><COLOR>Color</COLOR></UI></r>").Root()));
    EXPECT_EQ((Settings{{"PRINTER", ""},
                        {"OUTPUTFILETYPEPS", ""},
                        {"SELECTEDDISTILLERPROFILE", ""},
                        {"PRINTOUTPUTTYPE", ""},
                        {"COLOR", "Color"},
                        {"SLIDESPERPAGE", ""},
                        {"HANDOUTSHORIZONTAL", ""},
                        {"HANDOUTSVERTICAL", ""},
                        {"SCALETOFITPAGE", ""},
                        {"FRAMESLIDES", ""},
                        {"PRINTHIDDENSLIDES", ""},
                        {"PRINTCOMMENTSANDINKMARKUP", ""},
                        {"HIGHQUALITY", ""}}),
              Saved(plugin));
}

TEST(Settings, TakeTenThousandKeys) {
    const PluginUnderTest plugin;
    std::string xml = "<r><UI>";
    for (int i = 0; i < 10'000; ++i)
        xml += "<K" + std::to_string(i) + ">v</K" + std::to_string(i) + ">";
    plugin->ApplySettings(Document((xml + "</UI></r>").c_str()).Root());
    EXPECT_EQ(10'000U + 13U, Saved(plugin).size());
}

/// The printer that a conversion asks Word for.
class PrinterSettingTest : public testing::Test {
protected:
    std::string PrinterUsed(const PluginUnderTest& plugin) {
        std::string used;
        m_office.On("Word", 66, [&](const std::vector<std::wstring>& texts) {
            used = wxString(texts.at(0)).utf8_string();
            throw RecordingOffice::Raise{L"enough seen"};
        });
        JobItem item;
        item.fileName = "a.doc";
        item.paths.Add("/in/a.doc");
        wxString outputName;
        plugin->Convert(nullptr, item, "/out", outputName, nullptr);
        return used;
    }

    TemporaryFolder m_folder;
    TestPrinter m_anyPrinter{L"First", L"Test driver", m_folder.Write("a.ppd", "x").wstring()};
    RecordingOffice m_office{{L"Word.Application"}};
};

TEST_F(PrinterSettingTest, TakesEffectWhenAppliedAfterInitialisation) {
    const PluginUnderTest plugin;
    plugin->Initialize(wxString());
    EXPECT_EQ("First", PrinterUsed(plugin));
    const Document settings("<r><UI><PRINTER>Chosen</PRINTER></UI></r>");
    plugin->LoadSettings(settings.Root());
    EXPECT_EQ("First", PrinterUsed(plugin));
    plugin->ApplySettings(settings.Root());
    EXPECT_EQ("Chosen", PrinterUsed(plugin));
    plugin->Initialize(wxString());
    EXPECT_EQ("First", PrinterUsed(plugin));
}

} // namespace
