#include "tests/filter/DriverFixture.h"

#include "pstools/DistillerDevMode.h"

#include <algorithm>

DriverFixture::DriverFixture(const wchar_t* progId, const char* object, DISPID printOut)
    : m_userRecord(DistillerDevModeSize, 0x5a), m_office({progId}) {
    m_user.Set(REG_BINARY, m_userRecord);
    m_office.On(object, printOut, [this](const std::vector<std::wstring>& texts) {
        ASSERT_FALSE(texts.empty());
        m_recordWhilePrinting = m_user.Bytes();
        m_folder.Write(std::filesystem::path(texts.back()).filename(), m_printed);
    });
}

void DriverFixture::ExpectNothingLeftBehind() {
    EXPECT_EQ(DWORD{REG_BINARY}, m_user.Type());
    EXPECT_EQ(m_userRecord, m_user.Bytes());
    EXPECT_EQ(0U, m_office.LiveObjects());
}

bool DriverFixture::WasGuardedWhilePrinting() const {
    return std::equal(DistillerDevMode.begin(), DistillerDevMode.end(),
                      m_recordWhilePrinting.begin(), m_recordWhilePrinting.end());
}

long DriverFixture::CountOf(const std::string& call) const {
    const std::vector<std::string> calls = m_office.JournalInShort();
    return std::count(calls.begin(), calls.end(), call);
}

std::string NameOf(const testing::TestParamInfo<FailingCall>& test) {
    return std::string(test.param.object) + std::to_string(test.param.member);
}
