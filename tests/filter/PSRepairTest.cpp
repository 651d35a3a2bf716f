#include "pstools/PSRepair.h"

#include "pstools/FileProbe.h"
#include "tests/support/TemporaryFolder.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <algorithm>

namespace {

const std::string Header = "%!PS-Adobe-3.0\n";
const std::string Body = Header + "showpage\n" + std::string(3000, '%') + "\n%%EOF\n";

TEST(RepairPSHeader, CutsWhatStandsInFront) {
    const std::string nulBytes(3, '\0');
    const std::string printerLanguage = "\x1b%-12345X@PJL ENTER LANGUAGE=POSTSCRIPT\r\n";
    const struct {
        std::string front;
        std::string rest;
    } cases[] = {
        {"", Body},
        {"", "%!PS-Adobe-"},
        {"x", Header + nulBytes + Body},
        {"x", Body + Body},
        {printerLanguage, Body},
        {std::string(400, 'x'), Header},
        {std::string(501, 'x'), Body}, // the mark ends with byte 512
    };
    const TemporaryFolder folder;
    for (const auto& each : cases) {
        const auto path = folder.Write("a.ps", each.front + each.rest);
        EXPECT_EQ(PSRepair::Done, RepairPSHeader(path.wstring()));
        EXPECT_EQ(each.rest, ReadBytes(path));
    }
}

TEST(RepairPSHeader, LeavesAFileAloneThatHasNoHeaderAtItsBeginning) {
    const std::string contents[] = {
        "",
        std::string(5000, 'x'),
        "xx%!PS-Adobe",
        std::string("zero byte: \0", 12) + Body,
        std::string(502, 'x') + Body, // the mark ends behind byte 512
    };
    const TemporaryFolder folder;
    for (const std::string& content : contents) {
        const auto path = folder.Write("a.ps", content);
        EXPECT_EQ(PSRepair::NoHeader, RepairPSHeader(path.wstring()));
        EXPECT_EQ(content, ReadBytes(path));
    }
}

TEST(RepairPSHeader, AnswersThatTheFileCannotBeOpened) {
    const TemporaryFolder folder;
    EXPECT_EQ(PSRepair::CannotOpen, RepairPSHeader((folder / "missing.ps").wstring()));

    const auto path = folder.Write("held.ps", "x" + Body);
    const HANDLE holder = CreateFileW(path.wstring().c_str(), GENERIC_READ, FILE_SHARE_READ,
                                      nullptr, OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
    ASSERT_NE(INVALID_HANDLE_VALUE, holder);
    EXPECT_EQ(PSRepair::CannotOpen, RepairPSHeader(path.wstring()));
    CloseHandle(holder);
    EXPECT_EQ(PSRepair::Done, RepairPSHeader(path.wstring()));
}

/// A file in memory whose nth step fails; a failing write stops half-way, as on a full disk.
class FaultyFile : public PSRepair::File {
public:
    static constexpr int NoStep = -1;

    FaultyFile(std::string bytes, int failingStep)
        : content(std::move(bytes)), m_failingStep(failingStep) {}

    bool Read(void* buffer, DWORD size, DWORD& read) override {
        read = static_cast<DWORD>(std::min<std::size_t>(size, content.size() - m_position));
        if (Fails())
            read /= 2;
        content.copy(static_cast<char*>(buffer), read, m_position);
        m_position += read;
        return !m_failed;
    }
    bool Write(const void* buffer, DWORD size) override {
        const DWORD written = Fails() ? size / 2 : size;
        content.replace(m_position, written, static_cast<const char*>(buffer), written);
        m_position += written;
        return !m_failed;
    }
    bool Seek(DWORD position) override {
        if (Fails())
            return false;
        m_position = position;
        return true;
    }
    bool SetEnd() override {
        if (Fails())
            return false;
        content.resize(m_position);
        return true;
    }
    bool GetSize(std::uint64_t& size) override {
        size = pretendedSize ? pretendedSize : content.size();
        return !Fails();
    }

    int Steps() const { return m_steps; }

    std::string content;
    std::uint64_t pretendedSize = 0;

private:
    bool Fails() { return m_failed = m_steps++ == m_failingStep; }

    std::size_t m_position = 0;
    int m_failingStep;
    int m_steps = 0;
    bool m_failed = false;
};

TEST(CutToHeader, LeavesTheFileWholeWhicheverStepFails) {
    for (const std::size_t frontSize : {1U, 20U, 501U}) {
        const std::string before = std::string(frontSize, 'x') + Body;
        FaultyFile faultless(before, FaultyFile::NoStep);
        ASSERT_EQ(PSRepair::Done, PSRepair::CutToHeader(faultless));
        ASSERT_EQ(Body, faultless.content);

        for (int step = 0; step < faultless.Steps(); ++step) {
            FaultyFile file(before, step);
            EXPECT_EQ(PSRepair::NoHeader, PSRepair::CutToHeader(file)) << "step " << step;
            EXPECT_EQ(before, file.content) << "step " << step << ", front " << frontSize;
        }
    }
}

TEST(CutToHeader, LeavesAloneWhatIsTooLargeToMove) {
    FaultyFile file("x" + Body, FaultyFile::NoStep);
    file.pretendedSize = 1ULL << 32U;
    EXPECT_EQ(PSRepair::NoHeader, PSRepair::CutToHeader(file));
    EXPECT_EQ("x" + Body, file.content);
}

TEST(QueryFileSize, ReadsTheSizeOrLeavesItAlone) {
    const TemporaryFolder folder;
    std::uint64_t size = 42;
    QueryFileSize((folder / "missing.ps").wstring(), size);
    EXPECT_EQ(42U, size);

    const auto path = folder.Write("large.ps", "");
    std::filesystem::resize_file(path, 5'000'000'000); // sparse; beyond 32 bits
    QueryFileSize(path.wstring(), size);
    EXPECT_EQ(5'000'000'000U, size);
}

} // namespace
