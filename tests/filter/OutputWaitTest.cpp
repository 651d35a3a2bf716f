#include "office/OutputWait.h"

#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <atomic>
#include <fstream>
#include <thread>

namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;

/// Makes a file grow as fast as it can be appended to, for some time or until the object goes.
class GrowingFile {
public:
    GrowingFile(const std::filesystem::path& path, std::chrono::milliseconds time)
        : m_writer([this, path, end = Clock::now() + time] {
              std::ofstream file(path, std::ios::app);
              while (!m_stop && Clock::now() < end)
                  file << "more" << std::flush;
          }) {}
    ~GrowingFile() {
        m_stop = true;
        m_writer.join();
    }

private:
    std::atomic<bool> m_stop = false;
    std::thread m_writer;
};

class OutputWaitTest : public testing::Test {
protected:
    void TearDown() override { GetOutputWaitLimits() = {}; }

    TemporaryFolder m_folder;
    std::filesystem::path m_path = m_folder.Write("a.ps", "");
};

TEST_F(OutputWaitTest, LastsWhileTheFileGrows) {
    GetOutputWaitLimits() = {200ms, 1h};
    const auto start = Clock::now();
    const GrowingFile growing(m_path, 350ms);
    EXPECT_TRUE(WaitForOutput(m_path.wstring(), {100ms, false, 0s}));
    EXPECT_GE(Clock::now() - start, 350ms);
}

TEST_F(OutputWaitTest, EndsByItsLimits) {
    GetOutputWaitLimits() = {200ms, 1h};
    EXPECT_FALSE(WaitForOutput(m_path.wstring(), {5ms, false, 0s})); // it stays empty

    GetOutputWaitLimits() = {1h, 200ms};
    const GrowingFile growing(m_path, 1min);
    EXPECT_FALSE(WaitForOutput(m_path.wstring(), {50ms, false, 0s}));
}

TEST_F(OutputWaitTest, LetsALargeFileSettle) {
    for (const auto& [size, settles] :
         {std::pair{LargeOutputSize - 1, false}, {LargeOutputSize, true}}) {
        std::filesystem::resize_file(m_path, size);
        const auto start = Clock::now();
        EXPECT_TRUE(WaitForOutput(m_path.wstring(), {5ms, false, 1s}));
        EXPECT_EQ(settles, Clock::now() - start >= 1s) << size;
    }
}

} // namespace
