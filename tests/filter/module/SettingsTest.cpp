#include "tests/filter/module/FilterModule.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <map>

namespace {

using testing::Contains;

using Settings = std::map<wxString, wxString>;

/// What SaveSettings appends.
Settings Saved(const PluginUnderTest& plugin) {
    const XmlText target("<settings><other/></settings>");
    EXPECT_EQ(0, plugin->SaveSettings(target.GetRoot()));
    const wxXmlNode* const element = target.GetRoot()->GetChildren()->GetNext();
    EXPECT_EQ("UI", element->GetName());
    EXPECT_FALSE(element->GetNext());
    Settings settings;
    for (const wxXmlNode* setting = element->GetChildren(); setting; setting = setting->GetNext())
        EXPECT_TRUE(settings.emplace(setting->GetName(), setting->GetNodeContent()).second);
    return settings;
}

TEST(Settings, AreReadFromTheFirstElementWhereverItStands) {
    const std::pair<const char*, Settings> cases[] = {
        {"<r/>", {}},
        {"<r><ui><A>1</A></ui></r>", {}},
        {"<r><UI/></r>", {}},
        {"<UI><a><UI><A>below the root</A></UI></a></UI>", {{"A", "below the root"}}},
        {"<r>UI<!--UI--><?UI x?><UI><A>element</A></UI></r>", {{"A", "element"}}},
        {"<r><a><UI><A>deeper</A></UI></a><UI><A>child</A></UI></r>", {{"A", "child"}}},
        {"<r><a><b><UI><A>1</A></UI></b></a><c><UI><A>2</A></UI></c></r>", {{"A", "1"}}},
        {"<r><a><b/></a><c><d/><UI><A>in branch 2</A></UI></c></r>", {{"A", "in branch 2"}}},
        {"<r><UI><A>1</A><A>2</A><a>3</a></UI></r>", {{"A", "2"}, {"a", "3"}}},
        {"<r><UI>text<A/><!--A--><B>\xc3\xa4 &amp; \xd0\x96</B></UI></r>",
         {{"B", wxString::FromUTF8("\xc3\xa4 & \xd0\x96")}}},
        {"<r><UI><A>first<b/></A><C>one<!--two--></C></UI></r>", {{"A", ""}, {"C", "two"}}},
        {"<r><UI><A> 1 </A></UI><UI><A>2</A></UI></r>", {{"A", " 1 "}}},
    };
    for (const auto& [xml, settings] : cases) {
        const PluginUnderTest plugin;
        EXPECT_EQ(0, plugin->LoadSettings(XmlText(xml).GetRoot()));
        EXPECT_EQ(settings, Saved(plugin)) << xml;
    }
}

TEST(Settings, AccumulateAndKeepWhatTheFilterDoesNotKnow) {
    const PluginUnderTest plugin;
    for (const char* xml : {"<r><UI><MINE>kept</MINE><COLOR>Color</COLOR></UI></r>",
                            "<r><UI><COLOR>Grayscale</COLOR><MINE/></UI></r>", "<r/>"})
        plugin->LoadSettings(XmlText(xml).GetRoot());
    plugin->LoadSettings(nullptr);
    EXPECT_EQ((Settings{{"MINE", "kept"}, {"COLOR", "Grayscale"}}), Saved(plugin));

    EXPECT_EQ(0, plugin->ApplySettings(nullptr)); // enters every key that it asks for
    EXPECT_EQ(14U, Saved(plugin).size());
    EXPECT_EQ("", Saved(plugin).at("HIGHQUALITY"));
    EXPECT_EQ("Grayscale", Saved(plugin).at("COLOR"));

    const PluginUnderTest horizontal; // one order is enough
    horizontal->ApplySettings(
        XmlText("<r><UI><HANDOUTSHORIZONTAL>1</HANDOUTSHORIZONTAL></UI></r>").GetRoot());
    EXPECT_EQ(0U, Saved(horizontal).count("HANDOUTSVERTICAL"));
}

/// Settings as they reach PowerPoint.
class AppliedSettingsTest : public testing::Test {
protected:
    static void Apply(const PluginUnderTest& plugin, const Settings& settings) {
        wxString xml;
        for (const auto& [key, value] : settings)
            xml << '<' << key << '>' << value << "</" << key << '>';
        plugin->ApplySettings(XmlText("<r><UI>" + xml.utf8_string() + "</UI></r>").GetRoot());
    }

    /// The calls that set a print option in a conversion: "PrintOptions.2010 put (I4 0)".
    std::vector<std::string> OptionsPutBy(const PluginUnderTest& plugin) {
        m_office.On("Presentation", 2034, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
        const auto before = static_cast<std::ptrdiff_t>(m_office.Journal().size());
        wxString outputName;
        plugin->Convert(nullptr, ItemFor("/in/a.pptx"), "/out", outputName, nullptr);
        std::vector<std::string> put;
        std::copy_if(m_office.Journal().begin() + before, m_office.Journal().end(),
                     std::back_inserter(put),
                     [](const std::string& line) { return line.find("PrintOptions.") == 0; });
        return put;
    }

    TemporaryFolder m_folder;
    TestPrinter m_printer{L"First", L"Test driver", m_folder.Write("a.ppd", "x").wstring()};
    RecordingOffice m_office{{L"PowerPoint.Application"}};
};

TEST_F(AppliedSettingsTest, ArePutInPowerPointsNumbers) {
    const std::pair<Settings, std::string> cases[] = {
        {{{"COLOR", "Color"}}, " 2002=1"},
        {{{"COLOR", "Grayscale"}}, " 2002=2"},
        {{{"COLOR", "Pure Black and White"}}, " 2002=3"},
        {{{"COLOR", "color"}}, ""},
        {{{"PRINTOUTPUTTYPE", "Slides"}, {"SLIDESPERPAGE", "9"}}, " 2007=1"},
        {{{"PRINTOUTPUTTYPE", "Notes Pages"}}, " 2007=5"},
        {{{"PRINTOUTPUTTYPE", "Outline View"}}, " 2007=6"},
        {{{"PRINTOUTPUTTYPE", "handouts"}, {"SLIDESPERPAGE", "9"}}, ""},
        {{{"PRINTOUTPUTTYPE", "Handouts"}, {"SLIDESPERPAGE", "1"}}, " 2007=2 2007=1"},
        {{{"PRINTOUTPUTTYPE", "Handouts"}, {"SLIDESPERPAGE", "4"}}, " 2007=2 2007=8"},
        {{{"PRINTOUTPUTTYPE", "Handouts"}, {"SLIDESPERPAGE", "5"}}, " 2007=2"},
        {{{"PRINTOUTPUTTYPE", "Handouts"}, {"SLIDESPERPAGE", "9"}}, " 2007=2 2007=9"},
        {{{"HANDOUTSVERTICAL", "1"}}, " 2016=2"},
        {{{"HANDOUTSVERTICAL", "1"}, {"HANDOUTSHORIZONTAL", "1"}}, " 2016=1"},
        {{{"SCALETOFITPAGE", "1"}}, " 2004=1"},
        {{{"SCALETOFITPAGE", "true"}}, ""},
        {{{"PRINTHIDDENSLIDES", "1"}}, " 2009=1"},
        {{{"FRAMESLIDES", "1"}}, " 2005=1"},
        {{{"PRINTCOMMENTSANDINKMARKUP", "1"}}, " 2017=1"},
    };
    const PluginUnderTest untold;
    untold->Initialize(wxString());
    const std::vector<std::string> standard = OptionsPutBy(untold);
    EXPECT_EQ(6U, standard.size()); // printer, background and four switches
    for (auto [settings, expected] : cases) {
        const PluginUnderTest plugin;
        plugin->Initialize(wxString());
        settings["PRINTER"] = "First";
        Apply(plugin, settings);
        std::string put;
        for (const std::string& call : OptionsPutBy(plugin)) {
            if (std::find(standard.begin(), standard.end(), call) != standard.end())
                continue;
            int member = 0;
            int value = 0;
            std::sscanf(call.c_str(), "PrintOptions.%d put (I4 %d)", &member, &value);
            put += " " + std::to_string(member) + "=" + std::to_string(value);
        }
        EXPECT_EQ(expected, put);
    }
}

TEST_F(AppliedSettingsTest, TakeEffectWhenAppliedAfterInitialisation) {
    const std::string first = "PrintOptions.2015 put (\"First\")";
    const std::string chosen = "PrintOptions.2015 put (\"Chosen\")";
    const PluginUnderTest plugin;
    plugin->Initialize(wxString());
    plugin->LoadSettings(XmlText("<r><UI><PRINTER>Chosen</PRINTER></UI></r>").GetRoot());
    EXPECT_THAT(OptionsPutBy(plugin), Contains(first));
    Apply(plugin, {});
    EXPECT_THAT(OptionsPutBy(plugin), Contains(chosen));
    plugin->Initialize(wxString());
    EXPECT_THAT(OptionsPutBy(plugin), Contains(first));
}

} // namespace
