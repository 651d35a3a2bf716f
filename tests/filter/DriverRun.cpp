#include "pstools/DistillerDevMode.h"
#include "tests/filter/DriverTest.h"
#include "tests/filter/JournalCalls.h"

#include <algorithm>

namespace {

const std::vector<BYTE> UsersRecord(DistillerDevModeSize, 0x5a);

bool Prints(const DriverStep& step) {
    return step.line.find("<output>") != std::string::npos;
}

} // namespace

DriverRun::DriverRun(const Driver& driver)
    : office({wxString(driver.application + ".Application").ToStdWstring()}), input(driver.input),
      m_driver(driver) {
    user.Set(REG_BINARY, UsersRecord);
    office.NoteAtReleases([this] { return IsGuarded() ? " guarded" : ""; });
    const auto print = std::find_if(driver.steps.begin(), driver.steps.end(), Prints);
    OnCall(office, print->line, [this](const std::vector<std::wstring>& texts) {
        wasGuardedWhilePrinting = IsGuarded();
        if (printed)
            folder.Write(std::filesystem::path(texts.back()).filename(), *printed);
    });
}

std::vector<std::string> DriverRun::ExpectedJournal(const char* printerUsed) const {
    std::vector<std::string> journal;
    for (const DriverStep& step : m_driver.steps) {
        wxString line(step.line);
        line.Replace("<printer>", printerUsed);
        line.Replace("<output>", OutputPath());
        journal.push_back(line.utf8_string());
    }
    return journal;
}

bool DriverRun::IsGuarded() const {
    return user.Bytes() == std::vector<BYTE>(DistillerDevMode.begin(), DistillerDevMode.end());
}

void DriverRun::ExpectNothingLeftBehind() const {
    EXPECT_EQ(DWORD{REG_BINARY}, user.Type());
    EXPECT_EQ(UsersRecord, user.Bytes());
    EXPECT_EQ(0U, office.LiveObjects());
}
