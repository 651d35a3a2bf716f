#include "office/PublisherDriver.h"

#include "tests/filter/DriverFixture.h"
#include "tests/support/RegistryText.h"
#include "tests/support/TestPrinter.h"

#include <gmock/gmock.h>

namespace {

using testing::Each;
using testing::ElementsAre;

class PublisherDriverTest : public DriverFixture {
protected:
    PublisherDriverTest() : DriverFixture(L"Publisher.Application", "Publication", 54) {}

    ResultCode Print(const wxString& input = "/in/Report.final.pub") {
        return PrintPublisherDocument(input, m_folder.Path().wstring(), m_psName, &m_progress,
                                      &m_printer);
    }
};

TEST_F(PublisherDriverTest, PrintsByExactlyTheseCalls) {
    EXPECT_EQ(Result::Success, Print());
    EXPECT_THAT(
        m_office.Journal(),
        ElementsAre("Publisher.38 method (\"/in/Report.final.pub\", true, false, I4 3)",
                    "Publication.1 put (\"Proofer\")",
                    "Publication.54 method (I4 -1, I4 -1, \"" + OutputPath() + "\", I4 1, false)",
                    "Publication.48 method", "~Publication", "Publisher.39 method", "~Publisher"));
    EXPECT_EQ("Report.final.ps", m_psName);
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 15, 20, 30, 35, 85, 90, 95, 100));
    EXPECT_THAT(m_progress.texts, Each(wxString("Report.final")));
    EXPECT_TRUE(WasGuardedWhilePrinting());
    ExpectNothingLeftBehind();
}

TEST_F(PublisherDriverTest, PrefersTheDistillerPrinter) {
    const TestPrinter distiller(L"Adobe PDF", L"AdobePS Acrobat Distiller",
                                m_folder.Write("a.ppd", "x").wstring());
    m_printer.clear();
    EXPECT_EQ(Result::Success, Print());
    EXPECT_EQ("Publication.1 put (\"Adobe PDF\")", m_office.Journal()[1]);
}

TEST_F(PublisherDriverTest, ReturnsEarlyWithoutStartingPublisher) {
    EXPECT_EQ(Result::InputFileNotFound, Print(wxString()));
    EXPECT_TRUE(m_psName.empty());

    m_printer.clear();
    EXPECT_EQ(Result::DistillerNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10));
    m_printer = "Proofer";

    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Publisher.Application");
    m_progress.percents.clear();
    EXPECT_EQ(Result::PublisherNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5));

    constexpr wchar_t OldPublisher[] = L"SOFTWARE\\Microsoft\\Office\\9.0\\Publisher";
    WriteRegistryText(HKEY_CURRENT_USER, OldPublisher, L"Any", L"value");
    m_progress.percents.clear();
    EXPECT_EQ(Result::PublisherTooOld, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 15));

    // A nameless entry hides the old keys.
    WriteRegistryText(HKEY_CLASSES_ROOT, L"Publisher.Application", L"Any", L"value");
    EXPECT_EQ(Result::PublisherNotInstalled, Print());
    RegDeleteTreeW(HKEY_CURRENT_USER, OldPublisher);
    EXPECT_THAT(m_office.Journal(), ElementsAre());
    ExpectNothingLeftBehind();
}

TEST_F(PublisherDriverTest, ReportsAPublisherThatDoesNotStart) {
    m_office.RefuseToStart();
    EXPECT_EQ(Result::PublisherStartFailed, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 15));
    ExpectNothingLeftBehind();
}

TEST_F(PublisherDriverTest, DoesNotWaitForAFileThatIsNotThere) {
    m_office.On("Publication", 54, [](const auto&) {});
    EXPECT_EQ(Result::OutputFileNotFound, Print());
    EXPECT_EQ(100, m_progress.percents.back());
    ExpectNothingLeftBehind();
}

class PublisherDriverFailureTest : public PublisherDriverTest,
                                   public testing::WithParamInterface<FailingCall> {};

TEST_P(PublisherDriverFailureTest, TellsPublisherToQuit) {
    const auto [object, member, lastPercent] = GetParam();
    m_office.On(object, member, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
    EXPECT_EQ(Result::PrintFailed, Print());
    EXPECT_EQ(lastPercent, m_progress.percents.back());
    const bool isQuit = std::string(object) == "Publisher" && member == 39;
    EXPECT_EQ(isQuit ? 2 : 1, CountOf("Publisher.39"));
    EXPECT_EQ("~Publisher", m_office.Journal().back());
    ExpectNothingLeftBehind();
}

INSTANTIATE_TEST_SUITE_P(EachCall, PublisherDriverFailureTest,
                         testing::Values(FailingCall{"Publisher", 38, 20},
                                         FailingCall{"Publication", 1, 30},
                                         FailingCall{"Publication", 54, 35},
                                         FailingCall{"Publication", 48, 85},
                                         FailingCall{"Publisher", 39, 90}),
                         NameOf);

} // namespace
