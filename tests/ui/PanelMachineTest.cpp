#include "tests/ui/PanelFixture.h"

namespace {

constexpr char NoOffice[] = "Install MS-Office in your computer to print MS-Office related files.";
constexpr char NoPrinter[] = "Install Acrobat Distiller or any PS-Printer.";
constexpr char Ready[] = "Uncheck 'Rely on system fonts only' in the Adobe PDF Settings for "
                         "successful printing.";

class PanelMachineTest : public PanelFixture {};

TEST_F(PanelMachineTest, IsEnabledWhereItsChoicesCanTakeEffect) {
    const struct {
        bool hasOffice;
        bool hasPrinter;
        const char* serverVersion;
        bool isEnabled;
        const char* note;
    } states[] = {
        {true, true, "16", true, Ready},      {true, true, "15", true, Ready},
        {true, false, "16", true, NoPrinter}, {true, false, "15", false, NoPrinter},
        {false, true, "16", false, NoOffice}, {false, false, "16", false, NoOffice},
    };
    for (const auto& state : states) {
        m_machine = {};
        if (!state.hasOffice)
            m_machine.applications.clear();
        if (!state.hasPrinter)
            m_machine.printers.clear();
        m_serverVersion = state.serverVersion;
        BuildPanel({{"PRINTOUTPUTTYPE", "Handouts"}, {"OUTPUTFILETYPEPDF", "1"}});

        for (int id = ControlId::PrinterLabel; id < ControlId::NotePanel; ++id) {
            if (id != ControlId::HighQuality) { // PowerPoint's version has its say there
                EXPECT_EQ(state.isEnabled, Find(id)->IsThisEnabled()) << id;
            }
        }
        EXPECT_TRUE(AreEnabled({ControlId::OutputPS, ControlId::OutputPDF,
                                ControlId::DistillerProfile, ControlId::DistillerProfileLabel},
                               state.isEnabled));
        EXPECT_TRUE(Find(ControlId::NotePanel)->IsShown());
        wxString note = Find(ControlId::NotePanel)->GetChildren()[1]->GetLabel();
        note.Replace("\n", " ");
        EXPECT_EQ(state.note, note);
        // What cannot be used is still what is stored.
        EXPECT_EQ("Handouts", Saved()["PRINTOUTPUTTYPE"]);
        EXPECT_EQ("1", Saved()["HANDOUTSHORIZONTAL"]);
    }
}

TEST_F(PanelMachineTest, OffersHighQualityFromPowerPoint12On) {
    const struct {
        const wchar_t* application;
        int version;
        bool isOffered;
    } cases[] = {
        {L"PowerPoint.Application", 12, true},
        {L"PowerPoint.Application", 11, false},
        {L"Word.Application", 16, false},
    };
    for (const auto& each : cases) {
        m_machine.applications = {each.application};
        m_machine.officeVersion = each.version;
        BuildPanel({{"HIGHQUALITY", "1"}});
        EXPECT_TRUE(AreEnabled({ControlId::HighQuality}, each.isOffered));
        EXPECT_TRUE(IsTicked(ControlId::HighQuality));
        EXPECT_EQ("1", Saved()["HIGHQUALITY"]);
    }
}

TEST_F(PanelMachineTest, DisablesPdfWhereThereIsNoProfile) {
    m_machine.profiles.clear();
    BuildPanel();
    EXPECT_TRUE(AreEnabled({ControlId::OutputPS}, true));
    EXPECT_TRUE(AreEnabled(
        {ControlId::OutputPDF, ControlId::DistillerProfile, ControlId::DistillerProfileLabel},
        false));
    BuildPanel({{"OUTPUTFILETYPEPS", "0"}, {"OUTPUTFILETYPEPDF", "1"}});
    EXPECT_TRUE(AreEnabled({ControlId::OutputPDF}, false));
    EXPECT_TRUE(AreEnabled({ControlId::DistillerProfile, ControlId::DistillerProfileLabel}, true));
    EXPECT_EQ("", Saved()["SELECTEDDISTILLERPROFILE"]);
}

} // namespace
