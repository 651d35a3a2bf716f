#include "tests/host/Program.h"

#include "plugin/interface/ControlIds.h"
#include "tests/ui/settings/SettingsWindow.h"

#include <wx/frame.h>
#include <wx/utils.h>

namespace {

/// The program with the filter and the stand-ins that are installed with it.
std::vector<std::string> Command(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), QUILLON_PROGRAM);
    return arguments;
}

/// The whole program, as its user meets it.
class ProgramTest : public SettingsWindow {
protected:
    /// An environment variable for the length of an object's life.
    class Variable {
    public:
        Variable(const char* name, const char* value) : m_name(name) {
            m_was = wxGetEnv(m_name, &m_before);
            value ? wxSetEnv(m_name, value) : wxUnsetEnv(m_name);
        }
        ~Variable() { m_was ? wxSetEnv(m_name, m_before) : wxUnsetEnv(m_name); }
        Variable(const Variable&) = delete;
        Variable& operator=(const Variable&) = delete;

    private:
        wxString m_name;
        wxString m_before;
        bool m_was = false;
    };

    /// Converts the deck with the stored settings, and counts the pages.
    std::size_t PagesOfDeck() const {
        const std::string deck = SAMPLES "/deck.pptx";
        const RunResult run = RunProgram(Command(
            {"convert", deck, "--out", (m_folder / "out").string(), "--settings", m_file.string(),
             "--printer", "Quillon PostScript File Printer", "--ps", "--lang", "en"}));
        EXPECT_EQ(run.exitCode, 0) << run.out << run.err;
        const std::string output = ReadBytes(m_folder / "out" / "deck.ps");
        const std::string page = "\n%%Page: ";
        std::size_t pages = 0;
        for (std::size_t at = output.find(page); at != std::string::npos;
             at = output.find(page, at + 1))
            ++pages;
        return pages;
    }
};

TEST_F(ProgramTest, APanelSavedInGermanPrintsHandoutsInEnglish) {
    m_folder.Write("job.xml", "<UI><PRINTHIDDENSLIDES>1</PRINTHIDDENSLIDES>"
                              "<PRINTCOMMENTSANDINKMARKUP>0</PRINTCOMMENTSANDINKMARKUP></UI>");
    const std::size_t slides = PagesOfDeck();
    Speak("de");
    EXPECT_EQ(Open([this] {
                  Choose(ControlId::Print, "Handzettel");
                  Choose(ControlId::SlidesPerPage, "4");
                  Press(WXK_RETURN);
                  Until([this] { return !m_window->IsShown(); });
              }),
              wxID_SAVE);
    EXPECT_THAT(Stored(), HasSubstr("<PRINTOUTPUTTYPE>Handzettel</PRINTOUTPUTTYPE>"));
    Speak("en");
    EXPECT_GT(slides, 4U);
    EXPECT_EQ(PagesOfDeck(), (slides + 3) / 4);
}

TEST_F(ProgramTest, TheWindowOpensAndSaves) {
    const Variable language("LC_ALL", "C.UTF-8");
    RunningProgram program(Command({"settings", "--settings", m_file.string()}));
    auto* const ours = new wxFrame(nullptr, wxID_ANY, "Ours"); // the simulated user needs one
    const wxSize screen = wxGetDisplaySize();
    wxUIActionSimulator().MouseMove(screen.x / 2, screen.y / 2);
    Await("the file", [this] { // the first keys may come before the window does
        Press(WXK_RETURN);
        return std::filesystem::exists(m_file);
    });
    ours->Destroy();
    const RunResult run = program.Wait();
    EXPECT_EQ(run.exitCode, 0) << run.err;
    EXPECT_THAT(run.out, HasSubstr("saved in " + m_file.string()));
    EXPECT_THAT(Stored(), HasSubstr("<OUTPUTFILETYPEPDF>1</OUTPUTFILETYPEPDF>"));
}

TEST_F(ProgramTest, SaysWhenThereIsNoDisplay) {
    const Variable display("DISPLAY", nullptr);
    const Variable wayland("WAYLAND_DISPLAY", nullptr);
    const RunResult run =
        RunProgram(Command({"settings", "--settings", m_file.string(), "--json"}));
    EXPECT_EQ(run.exitCode, 2);
    ASSERT_EQ(run.Records("error").size(), 1U) << run.out;
    EXPECT_THAT(run.err, HasSubstr("no display"));
    EXPECT_FALSE(std::filesystem::exists(m_file));
}

TEST_F(ProgramTest, SpeaksTheDesktopsLanguageOrTheOneItIsTold) {
    struct Case {
        const char* environment;
        std::vector<std::string> options;
        const char* text;
    };
    const Case cases[] = {
        {"C.UTF-8", {}, "Input file not found"},
        {"de_AT.UTF-8", {}, "Eingabedatei nicht gefunden"},
        {"nl_NL.UTF-8", {}, "Input file not found"},
        {"de_DE.UTF-8", {"--lang", "en"}, "Input file not found"},
        {"C.UTF-8", {"--lang", "es_MX"}, "No se encuentra el archivo de entrada"},
    };
    for (const Case& each : cases) {
        const Variable language("LC_ALL", each.environment);
        std::vector<std::string> arguments = {"screen", (m_folder / "none.doc").string()};
        arguments.insert(arguments.end(), each.options.begin(), each.options.end());
        const RunResult run = RunProgram(Command(arguments));
        EXPECT_THAT(run.out, HasSubstr(each.text)) << each.environment;
    }
}

} // namespace
