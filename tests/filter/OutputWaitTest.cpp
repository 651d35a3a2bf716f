#include "office/OutputWait.h"

#include "pstools/FileProbe.h"

#include <wx/msw/registry.h>

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <vector>

namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;
using Reading = std::optional<std::uint64_t>; // none: the file cannot be read

std::size_t g_readings = 0;
std::function<Reading(std::size_t index)> g_read;

} // namespace

// In the place of the filter's own.
void QueryFileSize(const wxString& /*path*/, std::uint64_t& size) {
    size = g_read(g_readings++).value_or(size);
}

namespace {

constexpr OutputWait Patient{1ms, false, 0s};
constexpr OutputWait Trusting{1ms, true, 0s};

class OutputWaitTest : public testing::Test {
protected:
    void TearDown() override { GetOutputWaitLimits() = {}; }

    static bool Wait(const OutputWait& wait, std::function<Reading(std::size_t)> read) {
        g_readings = 0;
        g_read = std::move(read);
        return WaitForOutput("a.ps", wait);
    }
};

TEST_F(OutputWaitTest, EndsWithTwoReadingsThatAgree) {
    constexpr auto NoFile = std::nullopt;
    const struct {
        OutputWait wait;
        std::vector<Reading> readings;
    } cases[] = {
        {Patient, {5, 5}},
        {Patient, {NoFile, NoFile, 0, 0, 5, 9, 9}},
        {Patient, {5, NoFile}},
        {Trusting, {5, 6, 6}},
        {Trusting, {0, 0}},
        {Trusting, {NoFile, 0}},
        {Trusting, {5, NoFile, NoFile}},
        {Trusting, {5, NoFile, 5, 5}},
    };
    for (const auto& each : cases) {
        EXPECT_TRUE(Wait(each.wait, [&](std::size_t i) {
            return i < each.readings.size() ? each.readings[i] : 1000 + i;
        }));
        EXPECT_EQ(each.readings.size(), g_readings) << &each - cases;
    }
}

TEST_F(OutputWaitTest, LastsWhileTheFileGrows) {
    GetOutputWaitLimits() = {20ms, 1h};
    const auto end = Clock::now() + 100ms;
    EXPECT_TRUE(Wait(Patient, [end](std::size_t i) { return Clock::now() < end ? i : 1000; }));
    EXPECT_GE(Clock::now(), end);
}

TEST_F(OutputWaitTest, EndsByItsLimits) {
    GetOutputWaitLimits() = {20ms, 1h};
    EXPECT_FALSE(Wait(Patient, [](std::size_t) { return 0; }));
    GetOutputWaitLimits() = {1h, 20ms};
    EXPECT_FALSE(Wait(Patient, [](std::size_t i) { return i; }));
}

TEST_F(OutputWaitTest, EndsByTheLimitsOfTheHost) {
    wxRegKey host(wxRegKey::HKCU, "SOFTWARE\\Orvanta\\Marlo Quillon");
    ASSERT_TRUE(host.Create() && host.SetValue("OutputStallSeconds", 1L));
    EXPECT_FALSE(Wait(Patient, [](std::size_t) { return 0; }));
    EXPECT_TRUE(host.DeleteValue("OutputStallSeconds") && host.SetValue("OutputTotalSeconds", 1L));
    EXPECT_FALSE(Wait(Patient, [](std::size_t i) { return i; }));
    EXPECT_TRUE(host.DeleteValue("OutputTotalSeconds"));
}

TEST_F(OutputWaitTest, LetsALargeFileSettle) {
    for (const auto& [size, settleTime] :
         {std::pair{LargeOutputSize - 1, 20s}, {LargeOutputSize, 1s}}) {
        const auto start = Clock::now();
        const OutputWait wait{1ms, false, settleTime};
        EXPECT_TRUE(Wait(wait, [size = size](std::size_t) { return size; }));
        EXPECT_EQ(size >= LargeOutputSize, Clock::now() - start >= settleTime) << size;
    }
}

} // namespace
