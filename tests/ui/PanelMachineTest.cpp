#include "tests/ui/PanelFixture.h"
#include "ui/ControlIds.h"

#include <wx/stattext.h>

#include <gmock/gmock.h>

namespace {

constexpr char NoOffice[] = "Install MS-Office in your computer to print MS-Office related files.";
constexpr char NoPrinter[] = "Install Acrobat Distiller or any PS-Printer.";
constexpr char Ready[] = "Uncheck 'Rely on system fonts only' in the Adobe PDF Settings for "
                         "successful printing.";

struct MachineState {
    bool hasOffice;
    bool hasPrinter;
    const char* serverVersion;
    bool isEnabled;
    const char* note;
};

class PanelMachineTest : public PanelFixture, public testing::WithParamInterface<MachineState> {};

TEST_P(PanelMachineTest, IsEnabledWhereItsChoicesCanTakeEffect) {
    const MachineState& state = GetParam();
    if (!state.hasOffice)
        m_machine.applications.clear();
    if (!state.hasPrinter)
        m_machine.printers.clear();
    m_machine.serverVersion = state.serverVersion;
    BuildPanel({{"PRINTOUTPUTTYPE", "Handouts"}, {"OUTPUTFILETYPEPDF", "1"}});

    for (int id = ControlId::PrinterLabel; id < ControlId::NotePanel; ++id) {
        if (id != ControlId::HighQuality) { // PowerPoint's version has its say there
            EXPECT_EQ(state.isEnabled, Find(id)->IsThisEnabled()) << id;
        }
    }
    EXPECT_TRUE(AreEnabled({ControlId::OutputPS, ControlId::OutputPDF, ControlId::DistillerProfile,
                            ControlId::DistillerProfileLabel},
                           state.isEnabled));

    const wxWindow* note = Find(ControlId::NotePanel);
    EXPECT_TRUE(note->IsShown());
    wxString text = note->GetChildren()[1]->GetLabel();
    text.Replace("\n", " ");
    EXPECT_EQ(state.note, text);
    // What cannot be used is still what is stored.
    EXPECT_EQ("Handouts", Saved()["PRINTOUTPUTTYPE"]);
    EXPECT_EQ("1", Saved()["HANDOUTSHORIZONTAL"]);
}

INSTANTIATE_TEST_SUITE_P(States, PanelMachineTest,
                         testing::Values(MachineState{true, true, "16", true, Ready},
                                         MachineState{true, true, "15", true, Ready},
                                         MachineState{true, false, "16", true, NoPrinter},
                                         MachineState{true, false, "15", false, NoPrinter},
                                         MachineState{false, true, "16", false, NoOffice},
                                         MachineState{false, false, "16", false, NoOffice}));

class PanelVersionTest : public PanelFixture {};

TEST_F(PanelVersionTest, OffersHighQualityFromPowerPoint12On) {
    const struct {
        std::vector<std::wstring> applications;
        int version;
        bool isOffered;
    } cases[] = {
        {{L"PowerPoint.Application"}, 12, true},
        {{L"PowerPoint.Application"}, 11, false},
        {{L"Word.Application"}, 16, false},
    };
    for (const auto& one : cases) {
        m_machine.applications = one.applications;
        m_machine.officeVersion = one.version;
        BuildPanel({{"HIGHQUALITY", "1"}});
        EXPECT_TRUE(AreEnabled({ControlId::HighQuality}, one.isOffered));
        EXPECT_TRUE(IsTicked(ControlId::HighQuality));
        EXPECT_EQ("1", Saved()["HIGHQUALITY"]);
        m_testPrinters.clear();
        m_office.reset();
    }
}

TEST_F(PanelVersionTest, DisablesPdfWhereThereIsNoProfile) {
    m_machine.profiles.clear();
    BuildPanel();
    EXPECT_TRUE(AreEnabled({ControlId::OutputPS}, true));
    EXPECT_TRUE(AreEnabled(
        {ControlId::OutputPDF, ControlId::DistillerProfile, ControlId::DistillerProfileLabel},
        false));
    m_testPrinters.clear();
    BuildPanel({{"OUTPUTFILETYPEPS", "0"}, {"OUTPUTFILETYPEPDF", "1"}});
    EXPECT_TRUE(AreEnabled({ControlId::OutputPDF}, false));
    EXPECT_TRUE(AreEnabled({ControlId::DistillerProfile, ControlId::DistillerProfileLabel}, true));
    EXPECT_EQ("", Saved()["SELECTEDDISTILLERPROFILE"]);
}

} // namespace
