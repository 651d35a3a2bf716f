#include "office/OpenXmlCheck.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Processes.h"
#include "tests/support/RegistryText.h"

#include <wx/msw/registry.h>

#include <gmock/gmock.h>

#include <csignal>
#include <future>

namespace fs = std::filesystem;
using testing::Contains;
using testing::EndsWith;
using testing::HasSubstr;

namespace {

constexpr const char* Settings = "SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const wchar_t* WideSettings = L"SOFTWARE\\Orvanta\\Office Stand-Ins";

/// LibreOffice kept started for the documents to come.
class KeptEngineTest : public OfficeTest {
protected:
    void SetUp() override {
        OfficeTest::SetUp();
        SetLimit("DocumentsPerStart", 100);
    }

    /// The letter among the samples, with bytes that no test before has opened.
    fs::path NewLetter() const {
        static int number = 0;
        return m_files.Write("letter.docx",
                             ReadBytes(Sample("letter.docx")) + std::to_string(++number));
    }

    /// Waits for a process of the one that is kept, its supervisor included.
    pid_t AwaitProcess(const std::string& name) const {
        std::vector<pid_t> found;
        Await([&] {
            found = name == "office-engine" ? SupervisorsIn(m_temporary.Path())
                                            : EnginesIn(m_temporary.Path(), name);
            return !found.empty();
        });
        return found.empty() ? 0 : found.front();
    }

    /// A LibreOffice that has the fault which its file "fault" names.
    fs::path FaultyProgram(const fs::path& real) const {
        fs::path program = m_files / "program";
        fs::create_directory(program);
        for (const fs::directory_entry& entry : fs::directory_iterator(real))
            if (entry.path().filename() != "libmergedlo.so" && entry.path().filename() != "soffice")
                fs::create_symlink(entry, program / entry.path().filename());
        fs::copy_file(FAULTY_LIBREOFFICE, program / "libmergedlo.so");
        fs::copy_file(real / "soffice", program / "soffice"); // by which it is found
        fs::create_symlink(real / "libmergedlo.so", program / "real");
        return program;
    }

    /// What the document prints as, but for the date. Without the wait of PowerPoint's driver.
    std::string Printed(const fs::path& document) {
        const bool isPresentation = document.extension().string().rfind(".pp", 0) == 0;
        EXPECT_EQ("", isPresentation ? Print(document, PowerPointOptions()) : Print(document));
        std::string text = ReadBytes(PrintedFile(document));
        const std::size_t date = text.find("%%CreationDate");
        return text.erase(date, text.find('\n', date) - date);
    }
};

} // namespace

TEST_F(KeptEngineTest, PagesAreThoseOfALibreOfficeOfTheirOwn) {
    for (const char* name : {"letter.docx", "letter.doc", "report.docx", "book.xlsx", "book.xls",
                             "deck.pptx", "deck.ppt", "show.ppsx", "show.pps", "publication.pub"}) {
        const std::string bytes = ReadBytes(Sample(name));
        SetLimit("DocumentsPerStart", 100);
        const std::string kept = Printed(m_files.Write(name, bytes));
        EXPECT_GT(AwaitProcess("office-host"), 0);
        SetLimit("DocumentsPerStart", 1);
        // Other bytes of the same meaning, so that it is loaded again.
        EXPECT_EQ(Printed(m_files.Write(name, bytes + std::string(512, '\0'))), kept) << name;
    }
    EXPECT_THAT(m_log, Not(Contains(HasSubstr("started"))));
}

TEST_F(KeptEngineTest, HiddenSlidesCostNoFurtherLoad) {
    PowerPointOptions hidden;
    hidden.printHiddenSlides = true;
    EXPECT_EQ("", Print(Sample("deck.pptx"), PowerPointOptions()));
    const std::string shown = ReadBytes(PrintedFile(Sample("deck.pptx")));
    EXPECT_THAT(shown, HasSubstr("%%Pages: 8"));
    WriteRegistryText(HKEY_LOCAL_MACHINE, WideSettings, L"EnginePath", L"/nowhere");
    EXPECT_EQ("", Print(Sample("deck.pptx"), hidden));
    EXPECT_THAT(ReadBytes(PrintedFile(Sample("deck.pptx"))), HasSubstr("%%Pages: 9"));
}

TEST_F(KeptEngineTest, ItIsStartedAnewAfterSoManyDocuments) {
    SetLimit("DocumentsPerStart", 2);
    std::vector<pid_t> hosts;
    for (int document = 0; document < 3; ++document) {
        EXPECT_EQ("", Open(NewLetter()));
        hosts.push_back(AwaitProcess("office-host"));
    }
    EXPECT_EQ(1U, EnginesIn(m_temporary.Path(), "office-host").size());
    EXPECT_NE(hosts.front(), hosts.back());
}

TEST_F(KeptEngineTest, ItIsStartedAnewWhenItHasGrown) {
    // Of what a document may take, it may have a quarter: it has 80 MB from the beginning.
    for (const bool isRenewed : {false, true}) {
        SetLimit("MemoryMegabytes", isRenewed ? 300 : 3000);
        EXPECT_EQ("", Open(NewLetter()));
        const pid_t before = AwaitProcess("office-host");
        EXPECT_GT(before, 0);
        EXPECT_EQ("", Open(NewLetter()));
        Await([&] { return isRenewed == (AwaitProcess("office-host") != before); });
        EXPECT_EQ(isRenewed, AwaitProcess("office-host") != before);
        Call("DllUnregisterServer");
        Call("DllRegisterServer");
    }
}

TEST_F(KeptEngineTest, AProcessMayBeKilledOrStoppedWhileADocumentIsUnderWay) {
    SetLimit("StallSeconds", 2);
    struct Case {
        const char* process;
        int signal;
        const char* reason; // of the document's failure
    };
    const Case cases[] = {
        {"office-document", SIGKILL, "LibreOffice was ended from outside (signal 9, Killed)."},
        {"office-document", SIGSTOP, "LibreOffice stopped responding for 2 seconds."},
        {"office-document", SIGSEGV, ""}, // it is tried in another way
        {"office-host", SIGKILL, ""},
        {"office-host", SIGSTOP, ""},
        {"office-engine", SIGKILL,
         "LibreOffice's supervisor was ended from outside (signal 9, Killed)."},
    };
    for (const Case& each : cases) {
        const auto other = std::async(std::launch::async, [&] {
            AwaitProcess("office-document");
            Signal(AwaitProcess(each.process), each.signal);
        });
        EXPECT_THAT(Open(NewLetter()), EndsWith(each.reason)) << each.process << each.signal;
        EXPECT_EQ("", Open(NewLetter())) << "the next after " << each.process << each.signal;
    }
}

TEST_F(KeptEngineTest, AProcessMayBeKilledOrStoppedBetweenDocuments) {
    SetLimit("StallSeconds", 2);
    for (const char* process : {"office-host", "office-engine"})
        for (const int number : {SIGKILL, SIGSTOP}) {
            EXPECT_EQ("", Open(NewLetter()));
            Signal(AwaitProcess(process), number);
            EXPECT_EQ("", Open(NewLetter())) << process << number;
        }
}

TEST_F(KeptEngineTest, NothingOutlivesAClientThatIsKilled) {
    ExpectNothingOutlivesAKilledClient([&] { Open(NewLetter()); },
                                       [&] { return AwaitProcess("office-document"); });
}

TEST_F(KeptEngineTest, WhereItCannotBeKeptItIsStartedForEachDocumentAndTheReasonIsTold) {
    const fs::path real = MachineText(Settings, "EnginePath");
    const fs::path program = FaultyProgram(real);
    SetLimit("StallSeconds", 2);
    SetLimit("Examine", 1);
    const std::pair<const char*, const char*> faults[] = {
        {"refuses", "LibreOffice cannot be started as a library"},
        {"aborts", "it ended unexpectedly"},
        {"hangs", "it does not respond"},
        {"lacks", "this LibreOffice lacks what is needed to keep it started"},
        {"threads", "LibreOffice keeps threads running"},
    };
    for (const auto& [fault, reason] : faults) {
        m_files.Write("program/fault", fault);
        if (fault == std::string("threads")) // what the real one has is found by this name too
            fs::create_symlink(real / "libmergedlo.so", program / "libcomphelper.so");
        RegisterWithPath(program);
        EXPECT_TRUE(wxRegKey(wxRegKey::HKLM, Settings).HasValue("KeepingObstacle"));
        EXPECT_EQ(reason, MachineText(Settings, "KeepingObstacle"));
        m_log.clear();
        EXPECT_TRUE(TryOpenInWord(FilterPath(NewLetter()))) << fault;
        const std::string told = m_log.empty() ? "" : m_log.front();
        EXPECT_THAT(told, EndsWith(reason)) << fault;
        EXPECT_EQ(*reason != '\0', !told.empty()) << fault << told;
    }
}
