#include "office/WordDriver.h"

#include "office/OutputWait.h"
#include "tests/filter/DriverFixture.h"
#include "tests/support/TestPrinter.h"

#include <gmock/gmock.h>

#include <fstream>
#include <thread>

namespace {

using testing::Each;
using testing::ElementsAre;

class WordDriverTest : public DriverFixture {
protected:
    WordDriverTest() : DriverFixture(L"Word.Application", "Document", 444) {}

    ResultCode Print(const wxString& input = "/in/Report.final.docx") {
        return PrintWordDocument(input, m_folder.Path().wstring(), m_psName, &m_progress,
                                 &m_printer);
    }
};

TEST_F(WordDriverTest, PrintsByExactlyTheseCalls) {
    EXPECT_EQ(Result::Success, Print());
    EXPECT_THAT(
        m_office.Journal(),
        ElementsAre(
            "Word.6 get", "Documents.14 method (&omitted, &omitted, &omitted, &omitted)",
            "Documents.15 method (&\"/in/Report.final.docx\", &omitted, &I2 1, &omitted, "
            "&omitted, &omitted, &omitted, &omitted, &omitted, &omitted, &omitted, &omitted)",
            "~AddedDocument", "Word.19 get", "Dialogs.0 method (I4 97)", "Dialog.4 put (true)",
            "Dialog.1 put (\"Proofer\")", "Dialog.32001 method", "Word.66 put (\"Proofer\")",
            "Document.444 method (&I2 0, &I2 0, &omitted, &\"" + OutputPath() +
                "\", &omitted, &omitted, &omitted, &I2 1, &omitted, &omitted, &I2 1, &I2 0, "
                "&omitted, &I2 0, &I2 0, &I2 0, &I2 0, &I2 0)",
            "Document.1105 method (&I2 0, &omitted, &omitted)", "~Dialog", "~Dialogs", "~Document",
            "~Documents", "Word.1105 method (&I2 0, &omitted, &omitted)", "~Word"));

    EXPECT_EQ("Report.final.ps", m_psName);
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
    EXPECT_THAT(m_progress.percents,
                ElementsAre(5, 10, 15, 20, 25, 30, 35, 40, 55, 85, 90, 95, 100));
    EXPECT_THAT(m_progress.texts, Each(wxString("/in/Report.final.docx")));
    EXPECT_TRUE(WasGuardedWhilePrinting());
    ExpectNothingLeftBehind();
}

TEST_F(WordDriverTest, PrefersTheDistillerPrinter) {
    const TestPrinter distiller(L"Adobe PDF", L"AdobePS Acrobat Distiller",
                                m_folder.Write("a.ppd", "x").wstring());
    m_printer.clear();
    EXPECT_EQ(Result::Success, Print());
    EXPECT_THAT(m_office.Journal(), testing::Contains("Word.66 put (\"Adobe PDF\")"));
    ExpectNothingLeftBehind();
}

TEST_F(WordDriverTest, CutsThePrintedFileToItsHeader) {
    m_printed = "\x1b%-12345X@PJL\r\n" + m_printed;
    EXPECT_EQ(Result::Success, Print());
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
}

TEST_F(WordDriverTest, WritesOverAnEarlierFileAndNeedsNoProgressSink) {
    m_folder.Write("Report.final.ps", std::string(5000, 'o'));
    EXPECT_EQ(Result::Success, PrintWordDocument("/in/Report.final.docx", m_folder.Path().wstring(),
                                                 m_psName, nullptr, &m_printer));
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
}

TEST_F(WordDriverTest, ReturnsEarlyWithoutStartingWord) {
    EXPECT_EQ(Result::InputFileNotFound, Print(wxString()));
    EXPECT_TRUE(m_psName.empty());
    EXPECT_TRUE(m_progress.percents.empty());

    m_printer.clear();
    EXPECT_EQ(Result::DistillerNotInstalled, Print());
    EXPECT_EQ("Report.final.ps", m_psName);
    EXPECT_THAT(m_progress.percents, ElementsAre(5));

    m_progress.percents.clear();
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Word.Application");
    EXPECT_EQ(Result::WordNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5));
    EXPECT_THAT(m_office.Journal(), ElementsAre());
    ExpectNothingLeftBehind();
}

TEST_F(WordDriverTest, ReportsAWordThatDoesNotStart) {
    m_office.RefuseToStart();
    EXPECT_EQ(Result::WordStartFailed, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10));
    ExpectNothingLeftBehind();
}

class WordDriverFailureTest : public WordDriverTest,
                              public testing::WithParamInterface<FailingCall> {};

TEST_P(WordDriverFailureTest, ReleasesWordWithoutQuittingIt) {
    const auto [object, member, lastPercent] = GetParam();
    for (const bool raises : {true, false}) {
        m_progress.percents.clear();
        m_office.On(object, member, [raises](const auto&) {
            if (raises)
                throw RecordingOffice::Raise{L"no"};
            throw RecordingOffice::Fail{E_ACCESSDENIED};
        });
        EXPECT_EQ(Result::PrintFailed, Print());
        EXPECT_EQ(lastPercent, m_progress.percents.back());
        ExpectNothingLeftBehind();
    }
    // Quitting is asked for only where quitting is what fails.
    const bool isQuit = std::string(object) == "Word" && member == 1105;
    EXPECT_EQ(isQuit ? 2 : 0, CountOf("Word.1105"));
}

INSTANTIATE_TEST_SUITE_P(
    EachCall, WordDriverFailureTest,
    testing::Values(FailingCall{"Word", 6, 15}, FailingCall{"Documents", 14, 20},
                    FailingCall{"Documents", 15, 25}, FailingCall{"Word", 19, 30},
                    FailingCall{"Dialogs", 0, 35}, FailingCall{"Dialog", 4, 40},
                    FailingCall{"Dialog", 1, 40}, FailingCall{"Dialog", 32001, 40},
                    FailingCall{"Word", 66, 55}, FailingCall{"Document", 444, 55},
                    FailingCall{"Document", 1105, 85}, FailingCall{"Word", 1105, 90}),
    NameOf);

TEST_F(WordDriverTest, GivesUpOnAFileThatDoesNotCome) {
    using namespace std::chrono_literals;
    GetOutputWaitLimits() = {50ms, 5s};
    m_office.On("Document", 444, [](const auto&) {});
    EXPECT_EQ(Result::PrintFailed, Print());
    GetOutputWaitLimits() = {};
    EXPECT_EQ(55, m_progress.percents.back());
    ExpectNothingLeftBehind();
}

TEST_F(WordDriverTest, ReportsAFileThatIsGoneOrHasNoHeader) {
    m_office.On("Word", 1105, [this](const auto&) { std::filesystem::remove(OutputPath()); });
    EXPECT_EQ(Result::OutputFileNotFound, Print());
    EXPECT_EQ(100, m_progress.percents.back());

    m_office.On("Word", 1105, [](const auto&) {});
    m_printed = "no PostScript";
    EXPECT_EQ(Result::NoPSHeader, Print());
    EXPECT_EQ("no PostScript", ReadBytes(OutputPath()));
    ExpectNothingLeftBehind();
}

TEST_F(WordDriverTest, WaitsWhileTheFileGrows) {
    // Word prints in the background here: the file is there, and grows after the call returned.
    std::thread spooler;
    m_office.On("Document", 444, [&](const auto&) {
        m_folder.Write("Report.final.ps", PrintedFile);
        spooler = std::thread([path = OutputPath()] {
            const auto end = std::chrono::steady_clock::now() + std::chrono::milliseconds(350);
            std::ofstream file(path, std::ios::app);
            while (std::chrono::steady_clock::now() < end)
                file << "%" << std::flush;
        });
    });
    EXPECT_EQ(Result::Success, Print());
    const auto sizeWhenDone = std::filesystem::file_size(OutputPath());
    spooler.join();
    EXPECT_EQ(std::filesystem::file_size(OutputPath()), sizeWhenDone);
}

} // namespace
