#include "tests/support/Wine.h"
#include "tests/ui/PanelFixture.h"
#include "ui/ControlIds.h"

#include <wx/app.h>
#include <wx/uiaction.h>

#include <gmock/gmock.h>

namespace {

class PanelEventsTest : public PanelFixture {
protected:
    /// Clicks into the middle of a control with a real mouse pointer, and awaits `done`.
    template <typename Condition>
    bool ClickUntil(int id, Condition done) {
        wxUIActionSimulator mouse;
        const wxWindow* control = Find(id);
        const wxSize size = control->GetSize();
        mouse.MouseMove(control->ClientToScreen(wxPoint(size.x / 4, size.y / 2)));
        wxYield();
        mouse.MouseClick();
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(10);
        while (!done() && std::chrono::steady_clock::now() < end)
            wxYield();
        return done();
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
    Press(ControlId::OutputPDF);
    EXPECT_TRUE(AreEnabled({ControlId::DistillerProfile, ControlId::DistillerProfileLabel}, true));
    EXPECT_EQ("Press.joboptions", Saved()["SELECTEDDISTILLERPROFILE"]);
    Choose(ControlId::DistillerProfile, "Print.joboptions");
    Settings saved = Saved();
    EXPECT_EQ("Print.joboptions", saved["SELECTEDDISTILLERPROFILE"]);
    EXPECT_EQ("0 1", saved["OUTPUTFILETYPEPS"] + " " + saved["OUTPUTFILETYPEPDF"]);
    Press(ControlId::OutputPS);
    EXPECT_TRUE(AreEnabled({ControlId::DistillerProfile, ControlId::DistillerProfileLabel}, false));
    saved = Saved();
    EXPECT_EQ("1 0", saved["OUTPUTFILETYPEPS"] + " " + saved["OUTPUTFILETYPEPDF"]);
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
    const struct {
        int id;
        const char* key;
    } boxes[] = {
        {ControlId::ScaleToFitPaper, "SCALETOFITPAGE"},
        {ControlId::PrintHiddenSlides, "PRINTHIDDENSLIDES"},
        {ControlId::FrameSlides, "FRAMESLIDES"},
        {ControlId::HighQuality, "HIGHQUALITY"},
        {ControlId::PrintCommentsAndInkMarkup, "PRINTCOMMENTSANDINKMARKUP"},
    };
    for (const auto& box : boxes) {
        for (const bool ticked : {true, false}) {
            Settings expected = Saved();
            expected[box.key] = ticked ? "1" : "0";
            Tick(box.id, ticked);
            EXPECT_EQ(expected, Saved()) << box.key;
        }
    }
    Choose(ControlId::Colour, "Grayscale");
    Choose(ControlId::SlidesPerPage, "3");
    Press(ControlId::OrderVertical);
    Settings saved = Saved();
    EXPECT_EQ("Grayscale 3 0 1", saved["COLOR"] + " " + saved["SLIDESPERPAGE"] + " " +
                                     saved["HANDOUTSHORIZONTAL"] + " " + saved["HANDOUTSVERTICAL"]);
    Press(ControlId::OrderHorizontal);
    saved = Saved();
    EXPECT_EQ("1 0", saved["HANDOUTSHORIZONTAL"] + " " + saved["HANDOUTSVERTICAL"]);
}

TEST_F(PanelEventsTest, AnswersARealMouse) {
    if (RunsOnWine())
        GTEST_SKIP() << "without a window manager Wine's windows do not get the mouse";
    BuildPanel({{"PRINTOUTPUTTYPE", "Handouts"}});
    m_host->Show();
    m_host->Raise();
    wxYield();
    EXPECT_TRUE(ClickUntil(ControlId::FrameSlides, [&] { return Saved()["FRAMESLIDES"] == "1"; }));
    EXPECT_TRUE(
        ClickUntil(ControlId::OrderVertical, [&] { return Saved()["HANDOUTSVERTICAL"] == "1"; }));
    EXPECT_TRUE(
        ClickUntil(ControlId::OutputPDF, [&] { return Saved()["OUTPUTFILETYPEPDF"] == "1"; }));
    EXPECT_TRUE(Find(ControlId::DistillerProfile)->IsEnabled());
    EXPECT_EQ("0", Saved()["HANDOUTSHORIZONTAL"]);
}

} // namespace
