#include "office/PowerPointDriver.h"

#include "tests/filter/DriverTest.h"
#include "tests/filter/JournalCalls.h"

#include <wx/msw/registry.h>

namespace {

Driver PowerPoint(const PowerPointOptions& options) {
    Driver driver;
    driver.application = "PowerPoint";
    driver.input = "/in/Report.final.pptx";
    driver.print = [options](auto&&... arguments) {
        return PrintPowerPointPresentation(arguments..., &options);
    };
    driver.percents = {5, 10, 15, 20, 30, 40, 85, 90, 100};
    driver.steps = {
        {"PowerPoint.2001 get", 15},
        {"Presentations.2004 method (\"/in/Report.final.pptx\", I4 1, I4 1, I4 0)", 20},
        {"Presentation.2033 get", 30},
        {"PrintOptions.2015 put (\"<printer>\")", 30},
        {"PrintOptions.2002 put (I4 2)", 30},
        {"PrintOptions.2010 put (I4 0)", 30},
        {"PrintOptions.2007 put (I4 2)", 40},
        {"PrintOptions.2007 put (I4 4)", 40},
        {"PrintOptions.2016 put (I4 2)", 40},
        {"PrintOptions.2004 put (I4 0)", 40},
        {"PrintOptions.2009 put (I4 0)", 40},
        {"PrintOptions.2005 put (I4 1)", 40},
        {"PrintOptions.2017 put (I4 0)", 40},
        {"Presentation.2034 method (I4 -1, I4 -1, \"<output>\", I4 1, I4 1)", 40},
        {"Presentation.2039 method", 85},
        {"~PrintOptions"},
        {"~Presentation"},
        {"~Presentations"},
        {"~PowerPoint"},
    };
    driver.reportedName = "Report.final";
    driver.notInstalled = Result::PowerPointNotInstalled;
    driver.startFailed = Result::PowerPointStartFailed;
    driver.afterFailure = {"~PrintOptions", "~Presentation", "~Presentations", "~PowerPoint"};
    driver.percentsWithoutPrinter = {5, 10};
    return driver;
}

PowerPointOptions HandoutOptions() {
    PowerPointOptions options{"Handouts", "Grayscale", "6", "2"};
    options.frameSlides = true;
    return options;
}

INSTANTIATE_TEST_SUITE_P(PowerPoint, DriverTest, testing::Values(PowerPoint(HandoutOptions())));

TEST(PowerPointDriver, LeavesPowerPointTimeBeforeItLetsGo) {
    DriverRun run(PowerPoint({}));
    std::chrono::steady_clock::time_point closed;
    run.office.On("Presentation", 2039,
                  [&](const auto&) { closed = std::chrono::steady_clock::now(); });
    EXPECT_EQ(Result::Success, run.Print());
    EXPECT_GE(std::chrono::steady_clock::now() - closed, std::chrono::seconds(2));
}

constexpr long None = -1;
constexpr long NoKey = -2;

/// The user's default for printing in high quality.
class HighQualityDefaultTest : public testing::Test {
protected:
    HighQualityDefaultTest() { m_key.DeleteSelf(); }
    ~HighQualityDefaultTest() override { m_key.DeleteSelf(); }

    long Default() const {
        long value = None;
        if (m_key.HasValue(DefaultValue))
            m_key.QueryValue(DefaultValue, &value);
        return value;
    }

    static constexpr char DefaultValue[] = "PrintHighQualityDefault";
    wxRegKey m_key{"HKEY_CURRENT_USER\\Software\\Microsoft\\Office\\12.0\\PowerPoint\\Options"};
};

TEST_F(HighQualityDefaultTest, IsLentForThePrintAndStaysWhereItFails) {
    using Prepare = void (*)(DriverRun&);
    const Prepare nothing = [](DriverRun&) {};
    const Prepare noPrinter = [](DriverRun& run) { run.printer.clear(); };
    const Prepare noStart = [](DriverRun& run) { run.office.OnStart(DenyAccess); };
    const Prepare noOpening = [](DriverRun& run) {
        run.office.On("Presentations", 2004, [](const auto&) { Raise(); });
    };
    const struct {
        const char* what;
        Prepare prepare;
        long before;
        bool highQuality;
        long whilePrinting;
        long afterwards;
    } cases[] = {
        {"high quality", nothing, 0, true, 1, 0},
        {"no high quality", nothing, 1, false, 0, 1},
        {"no default before", nothing, None, true, 1, 0},
        {"no options before", nothing, NoKey, true, None, None},
        {"no printer", noPrinter, 0, true, None, 0},
        {"no start", noStart, 0, true, None, 1},
        {"no opening", noOpening, 0, true, None, 1},
    };
    for (const auto& each : cases) {
        if (each.before != NoKey)
            m_key.Create();
        if (each.before >= 0)
            m_key.SetValue(DefaultValue, each.before);
        PowerPointOptions options;
        options.highQuality = each.highQuality;
        DriverRun run(PowerPoint(options));
        each.prepare(run);
        long whilePrinting = None;
        run.office.On("Presentation", 2039, [&](const auto&) { whilePrinting = Default(); });
        run.Print();
        EXPECT_EQ(each.whilePrinting, whilePrinting) << each.what;
        EXPECT_EQ(each.afterwards, Default()) << each.what;
        EXPECT_EQ(each.before != NoKey, m_key.Exists()) << each.what;
        m_key.DeleteSelf();
    }
}

} // namespace
