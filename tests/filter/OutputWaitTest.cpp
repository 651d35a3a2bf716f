#include "office/OutputWait.h"

#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <atomic>
#include <fstream>
#include <thread>

namespace {

using namespace std::chrono_literals;

constexpr OutputWait Patient{5ms, false, 0s};
constexpr OutputWait EmptyWillDo{5ms, true, 0s};

class OutputWaitTest : public testing::Test {
protected:
    void SetUp() override { GetOutputWaitLimits() = {200ms, 5s}; }
    void TearDown() override { GetOutputWaitLimits() = {}; }

    TemporaryFolder m_folder;
};

TEST_F(OutputWaitTest, EndsWhenTwoReadingsAgree) {
    const auto path = m_folder.Write("done.ps", "content");
    EXPECT_TRUE(WaitForOutput(path.wstring(), Patient));
}

TEST_F(OutputWaitTest, GivesUpOnAFileThatNeverComesOrStaysEmpty) {
    EXPECT_FALSE(WaitForOutput((m_folder / "missing.ps").wstring(), Patient));
    const auto empty = m_folder.Write("empty.ps", "");
    EXPECT_FALSE(WaitForOutput(empty.wstring(), Patient));
}

TEST_F(OutputWaitTest, TakesNothingForStableWhereTheDriverSaysSo) {
    GetOutputWaitLimits() = {1h, 1h};
    EXPECT_TRUE(WaitForOutput((m_folder / "missing.ps").wstring(), EmptyWillDo));
}

/// Makes the file grow as fast as it can be appended to, until the object goes.
class GrowingFile {
public:
    explicit GrowingFile(const std::filesystem::path& path)
        : m_writer([this, path] {
              std::ofstream file(path, std::ios::app);
              while (!m_stop && file.tellp() < 64 << 20)
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

TEST_F(OutputWaitTest, GivesUpOnAFileThatNeverStopsGrowing) {
    GetOutputWaitLimits() = {10s, 200ms};
    const auto path = m_folder.Write("growing.ps", "");
    const GrowingFile growing(path);
    EXPECT_FALSE(WaitForOutput(path.wstring(), {50ms, false, 0s}));
}

TEST_F(OutputWaitTest, LetsALargeFileSettle) {
    const auto path = m_folder.Write("large.ps", "");
    for (const auto& [size, settles] :
         {std::pair{LargeOutputSize - 1, false}, {LargeOutputSize, true}}) {
        std::filesystem::resize_file(path, size);
        const auto start = std::chrono::steady_clock::now();
        EXPECT_TRUE(WaitForOutput(path.wstring(), {5ms, false, 1s}));
        EXPECT_EQ(settles, std::chrono::steady_clock::now() - start >= 1s) << size;
    }
}

} // namespace
