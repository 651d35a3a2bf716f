#include "office/PowerPointDriver.h"

#include "office/OutputWait.h"
#include "tests/filter/DriverFixture.h"
#include "tests/support/TestPrinter.h"

#include <wx/msw/registry.h>

#include <gmock/gmock.h>

#include <optional>

namespace {

using testing::Each;
using testing::ElementsAre;

constexpr char OptionsKey[] =
    "HKEY_CURRENT_USER\\Software\\Microsoft\\Office\\12.0\\PowerPoint\\Options";
constexpr char DefaultValue[] = "PrintHighQualityDefault";

/// The user's default for printing in high quality.
std::optional<long> HighQualityDefaultNow() {
    const wxRegKey key(OptionsKey);
    long value = 0;
    if (!key.Exists() || !key.HasValue(DefaultValue) || !key.QueryValue(DefaultValue, &value))
        return std::nullopt;
    return value;
}

class PowerPointDriverTest : public DriverFixture {
protected:
    PowerPointDriverTest() : DriverFixture(L"PowerPoint.Application", "Presentation", 2034) {
        wxRegKey(OptionsKey).DeleteSelf();
    }
    ~PowerPointDriverTest() override { wxRegKey(OptionsKey).DeleteSelf(); }

    ResultCode Print(const wxString& input = "/in/Report.final.pptx") {
        return PrintPowerPointPresentation(input, m_folder.Path().wstring(), m_psName, &m_progress,
                                           &m_printer, &m_options);
    }

    /// The options put, without the printer: "2007=4 2016=1 …".
    std::string OptionsPut() {
        // The print itself is refused, which spares the waits behind it.
        m_office.On("Presentation", 2034, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
        const std::size_t before = m_office.Journal().size();
        EXPECT_EQ(Result::PrintFailed, Print());
        std::string put;
        for (std::size_t i = before; i < m_office.Journal().size(); ++i) {
            const std::string& line = m_office.Journal()[i];
            int member = 0;
            int value = 0;
            if (std::sscanf(line.c_str(), "PrintOptions.%d put (I4 %d)", &member, &value) == 2)
                put +=
                    (put.empty() ? "" : " ") + std::to_string(member) + "=" + std::to_string(value);
        }
        return put;
    }

    PowerPointOptions m_options;
};

TEST_F(PowerPointDriverTest, PrintsByExactlyTheseCalls) {
    m_options.outputType = "Handouts";
    m_options.colour = "Grayscale";
    m_options.slidesPerPage = "6";
    m_options.handoutOrder = "2";
    m_options.frameSlides = true;
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(Result::Success, Print());
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(2300));
    EXPECT_THAT(
        m_office.Journal(),
        ElementsAre("PowerPoint.2001 get",
                    "Presentations.2004 method (\"/in/Report.final.pptx\", I4 1, I4 1, I4 0)",
                    "Presentation.2033 get", "PrintOptions.2015 put (\"Proofer\")",
                    "PrintOptions.2002 put (I4 2)", "PrintOptions.2010 put (I4 0)",
                    "PrintOptions.2007 put (I4 2)", "PrintOptions.2007 put (I4 4)",
                    "PrintOptions.2016 put (I4 2)", "PrintOptions.2004 put (I4 0)",
                    "PrintOptions.2009 put (I4 0)", "PrintOptions.2005 put (I4 1)",
                    "PrintOptions.2017 put (I4 0)",
                    "Presentation.2034 method (I4 -1, I4 -1, \"" + OutputPath() + "\", I4 1, I4 1)",
                    "Presentation.2039 method", "~PrintOptions", "~Presentation", "~Presentations",
                    "~PowerPoint"));
    EXPECT_EQ("Report.final.ps", m_psName);
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 15, 20, 30, 40, 85, 90, 100));
    EXPECT_THAT(m_progress.texts, Each(wxString("Report.final")));
    EXPECT_FALSE(WasGuardedWhilePrinting());
    EXPECT_EQ(std::nullopt, HighQualityDefaultNow()); // no key, nothing written
    ExpectNothingLeftBehind();
}

TEST_F(PowerPointDriverTest, PutsTheOptionsInPowerPointsNumbers) {
    // What is the same in each case stands at the end: four switches, all off.
    const std::string switches = " 2004=0 2009=0 2005=0 2017=0";
    const struct {
        const char* outputType;
        const char* colour;
        const char* slidesPerPage;
        const char* handoutOrder;
        const char* put;
    } cases[] = {
        {"", "", "", "", "2010=0"},
        {"Slides", "Color", "9", "1", "2002=1 2010=0 2007=1 2016=1"},
        {"Handouts", "Grayscale", "1", "2", "2002=2 2010=0 2007=2 2007=1 2016=2"},
        {"Handouts", "Pure Black and White", "2", "", "2002=3 2010=0 2007=2 2007=2"},
        {"Handouts", "", "3", "", "2010=0 2007=2 2007=3"},
        {"Handouts", "", "4", "", "2010=0 2007=2 2007=8"},
        {"Handouts", "", "5", "", "2010=0 2007=2"},
        {"Handouts", "", "6", "", "2010=0 2007=2 2007=4"},
        {"Handouts", "", "9", "", "2010=0 2007=2 2007=9"},
        {"Notes Pages", "color", "6", "3", "2010=0 2007=5"},
        {"Outline View", "Colour", "6", "", "2010=0 2007=6"},
        {"slides", "", "6", "1", "2010=0 2016=1"},
    };
    for (const auto& one : cases) {
        m_options = {one.outputType, one.colour, one.slidesPerPage, one.handoutOrder};
        EXPECT_EQ(one.put + switches, OptionsPut()) << one.outputType << one.slidesPerPage;
    }
    m_options = {};
    m_options.scaleToFit = m_options.printHiddenSlides = true;
    EXPECT_EQ("2010=0 2004=1 2009=1 2005=0 2017=0", OptionsPut());
    m_options = {};
    m_options.frameSlides = m_options.printCommentsAndInkMarkup = true;
    EXPECT_EQ("2010=0 2004=0 2009=0 2005=1 2017=1", OptionsPut());
}

TEST_F(PowerPointDriverTest, LendsTheHighQualityDefault) {
    const struct {
        std::optional<long> before;
        bool highQuality;
        long afterwards;
    } cases[] = {{0, true, 0}, {1, false, 1}, {std::nullopt, true, 0}};
    long duringThePrint = -1;
    m_office.On("Presentation", 2039,
                [&](const auto&) { duringThePrint = HighQualityDefaultNow().value_or(-1); });
    for (const auto& one : cases) {
        wxRegKey key(OptionsKey);
        ASSERT_TRUE(key.Create());
        if (one.before)
            key.SetValue(DefaultValue, *one.before);
        m_options.highQuality = one.highQuality;
        EXPECT_EQ(Result::Success, Print());
        EXPECT_EQ(one.highQuality ? 1 : 0, duringThePrint);
        EXPECT_EQ(one.afterwards, HighQualityDefaultNow());
        key.DeleteSelf();
    }
}

TEST_F(PowerPointDriverTest, LeavesTheHighQualityDefaultWhereItFails) {
    wxRegKey key(OptionsKey);
    ASSERT_TRUE(key.Create());
    key.SetValue(DefaultValue, 0L);
    m_options.highQuality = true;
    m_office.On("Presentations", 2004, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
    EXPECT_EQ(Result::PrintFailed, Print());
    EXPECT_EQ(1, HighQualityDefaultNow());

    key.SetValue(DefaultValue, 0L);
    m_office.RefuseToStart();
    EXPECT_EQ(Result::PowerPointStartFailed, Print());
    EXPECT_EQ(1, HighQualityDefaultNow());
}

TEST_F(PowerPointDriverTest, ReturnsEarlyWithoutStartingPowerPoint) {
    wxRegKey key(OptionsKey);
    ASSERT_TRUE(key.Create());
    EXPECT_EQ(Result::InputFileNotFound, Print(wxString()));
    EXPECT_TRUE(m_psName.empty());
    m_printer.clear();
    EXPECT_EQ(Result::DistillerNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10));
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"PowerPoint.Application");
    EXPECT_EQ(Result::PowerPointNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 5));
    EXPECT_EQ(std::nullopt, HighQualityDefaultNow());
    EXPECT_THAT(m_office.Journal(), ElementsAre());
}

class PowerPointDriverFailureTest : public PowerPointDriverTest,
                                    public testing::WithParamInterface<FailingCall> {};

TEST_P(PowerPointDriverFailureTest, ReleasesPowerPointWithoutQuittingIt) {
    const auto [object, member, lastPercent] = GetParam();
    m_options = {"Handouts", "Color", "6", "1"};
    m_office.On(object, member, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
    EXPECT_EQ(Result::PrintFailed, Print());
    EXPECT_EQ(lastPercent, m_progress.percents.back());
    EXPECT_EQ(0, CountOf("PowerPoint.2021"));
    ExpectNothingLeftBehind();
}

INSTANTIATE_TEST_SUITE_P(
    EachCall, PowerPointDriverFailureTest,
    testing::Values(FailingCall{"PowerPoint", 2001, 15}, FailingCall{"Presentations", 2004, 20},
                    FailingCall{"Presentation", 2033, 30}, FailingCall{"PrintOptions", 2015, 30},
                    FailingCall{"PrintOptions", 2002, 30}, FailingCall{"PrintOptions", 2010, 30},
                    FailingCall{"PrintOptions", 2007, 40}, FailingCall{"PrintOptions", 2016, 40},
                    FailingCall{"PrintOptions", 2004, 40}, FailingCall{"PrintOptions", 2009, 40},
                    FailingCall{"PrintOptions", 2005, 40}, FailingCall{"PrintOptions", 2017, 40},
                    FailingCall{"Presentation", 2034, 40}, FailingCall{"Presentation", 2039, 85}),
    NameOf);

} // namespace
