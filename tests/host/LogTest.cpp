#include "host/services/Log.h"

#include "host/services/OneLine.h"
#include "tests/host/Program.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/regex.h>

#include <gmock/gmock.h>

#include <memory>
#include <set>
#include <sstream>

namespace {

std::vector<std::string> LinesOf(const std::filesystem::path& file) {
    std::istringstream stream(ReadBytes(file));
    std::vector<std::string> lines;
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

TEST(Log, RecordsOfManyThreadsAndProcessesStayWhole) {
    constexpr std::size_t Processes = 4;
    constexpr std::size_t Threads = 3;
    constexpr std::size_t Records = 400;
    const TemporaryFolder folder;
    std::vector<std::unique_ptr<RunningProgram>> writers;
    writers.reserve(Processes);
    for (std::size_t process = 0; process < Processes; ++process)
        writers.push_back(std::make_unique<RunningProgram>(std::vector<std::string>{
            LOG_WRITER, (folder / "log").string(), "p" + std::to_string(process),
            std::to_string(Threads), std::to_string(Records)}));
    for (const auto& writer : writers)
        EXPECT_EQ(writer->Wait().exitCode, 0);

    const wxRegEx form(R"(^\d{4}-\d\d-\d\d \d\d:\d\d:\d\d\.\d{3} INFO  \[\d+\] )"
                       R"(LogWriter\.cpp:\d+ WriteRecords: <(p\d+\.\d+\.\d+)x*>$)");
    std::set<std::string> marks;
    for (const std::string& line : LinesOf(folder / "log")) {
        ASSERT_TRUE(form.Matches(line)) << line;
        EXPECT_TRUE(marks.insert(form.GetMatch(line, 1).utf8_string()).second) << "twice: " << line;
    }
    EXPECT_EQ(marks.size(), Processes * Threads * Records);
}

TEST(Log, APieceOfAnyKindMakesOneLineWithItsPlace) {
    const TemporaryFolder folder;
    ASSERT_TRUE(Log::ToFile(folder / "log"));
    SetLevelAndGetLogger(LevelError, "C:\\src\\Some.cpp", "Do", 7)
        << "two\nlines, " << wxString::FromUTF8("\xD0\x96 ") << "\xFF not UTF-8"
        << static_cast<const char*>(nullptr);
    const std::vector<std::string> lines = LinesOf(folder / "log");
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_THAT(lines[0], HasSubstr("ERROR ["));
    EXPECT_THAT(lines[0], HasSubstr("] Some.cpp:7 Do: two\\nlines, \xD0\x96 \xC3\xBF not UTF-8"));
}

TEST(Log, AFileThatCannotBeOpenedChangesNothing) {
    const TemporaryFolder folder;
    ASSERT_TRUE(Log::ToFile(folder / "log"));
    EXPECT_FALSE(Log::ToFile(folder / "missing" / "log"));
    EXPECT_FALSE(Log::ToFile(folder.Path()));
    SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__) << "here";
    EXPECT_EQ(LinesOf(folder / "log").size(), 1U);
}

TEST(OneLine, EscapesWhatWouldBreakOrTurnALine) {
    const std::pair<std::wstring, std::string> cases[] = {
        {L"plain \u0416 \"q\" \\ ;", "plain \xD0\x96 \"q\" \\ ;"},
        {L"a\r\n\tb", "a\\r\\n\\tb"},
        {L"\x1b[31mred", "\\x1b[31mred"},
        {L"\x7f\x85", "\\x7f\\x85"},
        {L"a\u2028b\u202Ec", "a\\u2028b\\u202ec"},
        {{L'a', static_cast<wchar_t>(0xD800)}, "a\\ud800"},
        {L"\U0001F600", "\xF0\x9F\x98\x80"},
    };
    for (const auto& [text, line] : cases)
        EXPECT_EQ(OneLine(text).utf8_string(), line);
}

} // namespace
