#include "tests/support/Wine.h"
#include "tests/ui/PanelFixture.h"

#include <wx/app.h>
#include <wx/checkbox.h>
#include <wx/uiaction.h>

namespace {

class PanelEventsTest : public PanelFixture {
protected:
    /// Clicks into a control with a real mouse pointer, and waits for its setting to be on.
    bool ClickUntil(int id, const Setting& setting) {
        wxUIActionSimulator mouse;
        const wxWindow* control = Find(id);
        const wxSize size = control->GetSize();
        mouse.MouseMove(control->ClientToScreen(wxPoint(size.x / 4, size.y / 2)));
        wxYield();
        mouse.MouseClick();
        return Until([&] { return Saved()[setting.key] == "1"; });
    }

    bool HandoutsEnabled(bool enabled) const {
        return AreEnabled({ControlId::HandoutsHeading, ControlId::SlidesPerPageLabel,
                           ControlId::SlidesPerPage, ControlId::NoImage, ControlId::OrderLabel,
                           ControlId::OrderHorizontal, ControlId::OrderVertical},
                          enabled);
    }
};

TEST_F(PanelEventsTest, HandoutsBringTheirControlsToLife) {
    BuildPanel();
    EXPECT_TRUE(HandoutsEnabled(false));
    Choose(ControlId::Print, "Handouts");
    EXPECT_TRUE(HandoutsEnabled(true));
    for (const char* other : {"Slides", "Notes Pages", "Outline View"}) {
        Choose(ControlId::Print, other);
        EXPECT_TRUE(HandoutsEnabled(false)) << other;
        EXPECT_EQ(other, Saved()["PRINTOUTPUTTYPE"]);
    }
}

TEST_F(PanelEventsTest, PdfBringsTheProfileToLife) {
    BuildPanel();
    const std::initializer_list<int> profile = {ControlId::DistillerProfile,
                                                ControlId::DistillerProfileLabel};
    Press(ControlId::OutputPDF);
    EXPECT_TRUE(AreEnabled(profile, true));
    EXPECT_EQ("Press.joboptions", Saved()["SELECTEDDISTILLERPROFILE"]);
    Choose(ControlId::DistillerProfile, "Print.joboptions");
    EXPECT_EQ("Print.joboptions", Saved()["SELECTEDDISTILLERPROFILE"]);
    EXPECT_EQ("0 1", Saved()["OUTPUTFILETYPEPS"] + " " + Saved()["OUTPUTFILETYPEPDF"]);
    Press(ControlId::OutputPS);
    EXPECT_TRUE(AreEnabled(profile, false));
    EXPECT_EQ("1 0", Saved()["OUTPUTFILETYPEPS"] + " " + Saved()["OUTPUTFILETYPEPDF"]);
}

TEST_F(PanelEventsTest, ThePrinterDecidesWhetherTheNoteIsShown) {
    m_machine.printers = {L"Proofer", L"My Adobe PDF", L"adobe"};
    BuildPanel();
    const wxWindow* note = Find(ControlId::NotePanel);
    EXPECT_TRUE(note->IsShown()); // until the user picks one
    for (const auto& [printer, shown] :
         {std::pair{"Proofer", false}, {"My Adobe PDF", true}, {"adobe", false}}) {
        Choose(ControlId::Printer, printer);
        EXPECT_EQ(shown, note->IsShown()) << printer;
        EXPECT_EQ(printer, Saved()["PRINTER"]);
    }
}

TEST_F(PanelEventsTest, EachControlSetsItsOwnSetting) {
    BuildPanel();
    Settings expected = Saved();
    for (const auto& [id, setting] : SettingControls) {
        for (const SettingChoice& choice : setting.choices) {
            expected[setting.key] = choice.text;
            Choose(id, choice.text);
            EXPECT_EQ(expected, Saved());
        }
        for (const bool ticked : {true, false}) {
            if (!dynamic_cast<wxCheckBox*>(Find(id)))
                continue;
            expected[setting.key] = ticked ? "1" : "0";
            Tick(id, ticked);
            EXPECT_EQ(expected, Saved());
        }
    }
    for (const bool vertical : {true, false}) {
        expected["HANDOUTSVERTICAL"] = vertical ? "1" : "0";
        expected["HANDOUTSHORIZONTAL"] = vertical ? "0" : "1";
        Press(vertical ? ControlId::OrderVertical : ControlId::OrderHorizontal);
        EXPECT_EQ(expected, Saved());
    }
}

TEST_F(PanelEventsTest, AnswersARealMouse) {
    if (RunsOnWine())
        GTEST_SKIP() << "without a window manager Wine's windows do not get the mouse";
    BuildPanel({{"PRINTOUTPUTTYPE", "Handouts"}});
    m_host->Show();
    m_host->Raise();
    wxYield();
    EXPECT_TRUE(ClickUntil(ControlId::FrameSlides, FilterSettings::FrameSlides));
    EXPECT_TRUE(ClickUntil(ControlId::OrderVertical, FilterSettings::HandoutsVertical));
    EXPECT_TRUE(ClickUntil(ControlId::OutputPDF, FilterSettings::OutputPDF));
    EXPECT_TRUE(Find(ControlId::DistillerProfile)->IsEnabled());
    EXPECT_EQ("0", Saved()["HANDOUTSHORIZONTAL"]);
}

} // namespace
