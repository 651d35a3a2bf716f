#include "plugin/interface/ControlIds.h"
#include "tests/ui/PanelFixture.h"

namespace {

class PanelSettingsTest : public PanelFixture {};

const Settings Standard = {
    {"PRINTER", "Adobe PDF"},
    {"OUTPUTFILETYPEPS", "1"},
    {"OUTPUTFILETYPEPDF", "0"},
    {"SELECTEDDISTILLERPROFILE", ""},
    {"PRINTOUTPUTTYPE", "Slides"},
    {"COLOR", "Color"},
    {"SLIDESPERPAGE", "6"},
    {"HANDOUTSHORIZONTAL", "1"},
    {"HANDOUTSVERTICAL", "0"},
    {"SCALETOFITPAGE", "0"},
    {"FRAMESLIDES", "0"},
    {"PRINTHIDDENSLIDES", "1"},
    {"PRINTCOMMENTSANDINKMARKUP", "1"},
    {"HIGHQUALITY", "0"},
};

TEST_F(PanelSettingsTest, StartFromTheStandard) {
    BuildPanel();
    EXPECT_EQ("Slides", Selection(ControlId::Print));
    EXPECT_EQ("Color", Selection(ControlId::Colour));
    EXPECT_EQ("6", Selection(ControlId::SlidesPerPage));
    EXPECT_EQ("Adobe PDF", Selection(ControlId::Printer));
    EXPECT_EQ("Press.joboptions", Selection(ControlId::DistillerProfile));
    EXPECT_EQ(Standard, Saved());
}

TEST_F(PanelSettingsTest, ShowAndKeepWhatIsStored) {
    const Settings stored = {
        {"PRINTER", "Proofer"},
        {"OUTPUTFILETYPEPS", "0"},
        {"OUTPUTFILETYPEPDF", "1"},
        {"SELECTEDDISTILLERPROFILE", "Print.joboptions"},
        {"PRINTOUTPUTTYPE", "Handouts"},
        {"COLOR", "Pure Black and White"},
        {"SLIDESPERPAGE", "9"},
        {"HANDOUTSHORIZONTAL", "0"},
        {"HANDOUTSVERTICAL", "1"},
        {"SCALETOFITPAGE", "1"},
        {"FRAMESLIDES", "1"},
        {"PRINTHIDDENSLIDES", "0"},
        {"PRINTCOMMENTSANDINKMARKUP", "0"},
        {"HIGHQUALITY", "1"},
    };
    BuildPanel(stored);
    EXPECT_EQ("Proofer", Selection(ControlId::Printer));
    EXPECT_EQ("Print.joboptions", Selection(ControlId::DistillerProfile));
    EXPECT_EQ("Handouts", Selection(ControlId::Print));
    EXPECT_EQ("Pure Black and White", Selection(ControlId::Colour));
    EXPECT_EQ("9", Selection(ControlId::SlidesPerPage));
    for (const int ticked :
         {ControlId::OutputPDF, ControlId::OrderVertical, ControlId::ScaleToFitPaper,
          ControlId::FrameSlides, ControlId::HighQuality})
        EXPECT_TRUE(IsTicked(ticked)) << ticked;
    for (const int clear : {ControlId::OutputPS, ControlId::OrderHorizontal,
                            ControlId::PrintHiddenSlides, ControlId::PrintCommentsAndInkMarkup})
        EXPECT_FALSE(IsTicked(clear)) << clear;
    EXPECT_EQ(stored, Saved());
}

TEST_F(PanelSettingsTest, KeepTextsThatMatchNoEntry) {
    Settings stored = Standard;
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
    Settings expected = Standard;
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
    EXPECT_EQ("1", Saved()["FRAMESLIDES"]);
    CloseHost();
    EXPECT_EQ("1", Saved()["FRAMESLIDES"]); // what was collected before stays
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
    EXPECT_EQ("0", Saved()["FRAMESLIDES"]);
    m_panel = second;
    Tick(ControlId::FrameSlides, true);
    EXPECT_EQ("1", Saved()["FRAMESLIDES"]);
}

} // namespace
