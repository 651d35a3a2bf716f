#include "platform/win32/base/LogSink.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

class LogSink : public testing::Test {
protected:
    LogSink() {
        win32::SetLogSink([this](const std::string& record) { m_records.push_back(record); });
    }
    ~LogSink() override { win32::SetLogSink(nullptr); }

    std::vector<std::string> m_records;
};

TEST_F(LogSink, TakesWhatProgramsSayToADebugger) {
    OutputDebugStringW(L"Grüße \x1F5A8\r\n");
    OutputDebugStringW(L"half a pair: \xD83D.");
    OutputDebugStringW(nullptr);
    EXPECT_EQ((std::vector<std::string>{"Gr\xC3\xBC\xC3\x9F"
                                        "e \xF0\x9F\x96\xA8",
                                        "half a pair: \xEF\xBF\xBD."}),
              m_records);
}

TEST_F(LogSink, IsToldOfArgumentsThatAreNotSupported) {
    IStorage* storage = nullptr;
    EXPECT_EQ(STG_E_INVALIDFLAG,
              StgOpenStorage(L"/tmp/x", nullptr, STGM_READ, nullptr, 0, &storage));
    ASSERT_EQ(1U, m_records.size());
    EXPECT_NE(std::string::npos, m_records[0].find("StgOpenStorage"));
}

TEST_F(LogSink, MayLogAndThrow) {
    win32::SetLogSink([this](const std::string& record) {
        m_records.push_back(record);
        OutputDebugStringW(L"logged from the sink, to standard error");
        throw 1;
    });
    OutputDebugStringW(L"first");
    OutputDebugStringW(L"second");
    EXPECT_EQ((std::vector<std::string>{"first", "second"}), m_records);
}

} // namespace
