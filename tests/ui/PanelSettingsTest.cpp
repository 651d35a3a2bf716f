#include "tests/ui/PanelFixture.h"

namespace {

class PanelSettingsTest : public PanelFixture {};

Settings Standard() {
    Settings settings;
    for (const Setting* const setting : FilterSettings::All)
        settings[setting->key] = setting->panelStandard;
    settings["PRINTER"] = "Adobe PDF";
    return settings;
}

TEST_F(PanelSettingsTest, StartFromTheStandard) {
    BuildPanel();
    EXPECT_EQ(Standard(), Saved());
    Settings shown = Standard();
    shown["SELECTEDDISTILLERPROFILE"] = "Press.joboptions"; // the first, until PDF is chosen
    EXPECT_EQ(shown, Shown());
}

TEST_F(PanelSettingsTest, ShowAndKeepWhatIsStored) {
    Settings stored = {{"PRINTER", "Proofer"}, {"SELECTEDDISTILLERPROFILE", "Print.joboptions"}};
    for (const Setting* const setting : FilterSettings::All)
        if (setting->kind == Setting::Flag)
            stored[setting->key] = *setting->panelStandard == '1' ? "0" : "1";
        else
            for (const SettingChoice& choice : setting->choices) // the last
                stored[setting->key] = choice.text;
    BuildPanel(stored);
    EXPECT_EQ(stored, Shown());
    EXPECT_EQ(stored, Saved());
}

TEST_F(PanelSettingsTest, KeepTextsThatMatchNoEntry) {
    Settings stored = Standard();
    stored["PRINTER"] = "Gone";
    stored["PRINTOUTPUTTYPE"] = "Handzettel";
    stored["COLOR"] = "\xd0\x9d\xd0\xb5\xd1\x82";
    stored["SLIDESPERPAGE"] = "5";
    stored["OUTPUTFILETYPEPS"] = "0";
    stored["OUTPUTFILETYPEPDF"] = "1";
    stored["SELECTEDDISTILLERPROFILE"] = "Gone.joboptions";
    stored["ANOTHER"] = "filter's";
    BuildPanel(stored);
    for (const int id : {ControlId::Printer, ControlId::Print, ControlId::Colour,
                         ControlId::SlidesPerPage, ControlId::DistillerProfile})
        EXPECT_EQ("", Selection(id)) << id;
    EXPECT_TRUE(AreEnabled({ControlId::SlidesPerPage, ControlId::OrderVertical}, false));
    EXPECT_EQ(stored, Saved());
}

TEST_F(PanelSettingsTest, ReadFlagsByTheDigitAndHandoutsInAnyCase) {
    BuildPanel({{"HIGHQUALITY", "true"},
                {"FRAMESLIDES", " 1"},
                {"PRINTHIDDENSLIDES", "01"},
                {"SCALETOFITPAGE", ""},
                {"OUTPUTFILETYPEPS", "yes"},
                {"PRINTOUTPUTTYPE", "handouts"}});
    Settings expected = Standard();
    expected["PRINTHIDDENSLIDES"] = "0";
    expected["OUTPUTFILETYPEPS"] = "0";
    expected["PRINTOUTPUTTYPE"] = "handouts";
    EXPECT_EQ(expected, Saved());
    EXPECT_EQ("Handouts", Selection(ControlId::Print));
    EXPECT_TRUE(AreEnabled({ControlId::SlidesPerPage, ControlId::OrderVertical}, true));
}

TEST_F(PanelSettingsTest, AreThePanelsAsLongAsItLives) {
    BuildPanel();
    Tick(ControlId::FrameSlides, true);
    EXPECT_EQ("1", Saved()[FilterSettings::FrameSlides.key]);
    CloseHost();
    EXPECT_EQ("1", Saved()[FilterSettings::FrameSlides.key]); // what was collected before stays
    BuildPanel();
    m_plugin.reset(); // the panel is its host's
    EXPECT_TRUE(Find(ControlId::FrameSlides)->IsThisEnabled());
}

TEST_F(PanelSettingsTest, BelongToTheNewestPanel) {
    BuildPanel();
    wxWindow* first = m_panel;
    wxWindow* second = m_plugin->CreateSettingsPanel(m_host);
    m_panel = first;
    Tick(ControlId::FrameSlides, true);
    EXPECT_EQ("0", Saved()[FilterSettings::FrameSlides.key]);
    m_panel = second;
    Tick(ControlId::FrameSlides, true);
    EXPECT_EQ("1", Saved()[FilterSettings::FrameSlides.key]);
}

} // namespace
