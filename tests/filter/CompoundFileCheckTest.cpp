#include "office/CompoundFileCheck.h"

#include "plugin/interface/ResultCodes.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <windows.h>

#include <gtest/gtest.h>

namespace {

using Check = int (*)(const wxString&);

constexpr Check AllChecks[] = {CheckWordCompoundFile, CheckExcelCompoundFile,
                               CheckPowerPointCompoundFile, CheckPublisherFile};

class CompoundFileCheckTest : public testing::Test {
protected:
    static CompoundFile WordFile() {
        CompoundFile file;
        file.AddStream(u"WordDocument", std::string(5000, 'd'));
        return file;
    }

    TemporaryFolder m_folder;
};

TEST_F(CompoundFileCheckTest, RefusesWhatIsNoCompoundFile) {
    CompoundFile cyclic = WordFile();
    const std::filesystem::path paths[] = {
        m_folder.Write("empty.doc", ""),
        m_folder.Write("zip.doc", "PK\x03\x04 and the rest of a package"),
        m_folder.Write("noise.doc", std::string(3000, '\x5a')),
        m_folder.Write("header only.doc", cyclic.Bytes().substr(0, 512)),
        m_folder / "missing.doc",
        m_folder.Path(),
    };
    cyclic.MakeDirectoryCyclic();
    const auto hostile = m_folder.Write("cyclic.doc", cyclic.Bytes());
    for (const Check check : AllChecks) {
        for (const auto& path : paths)
            EXPECT_EQ(Result::InvalidInputFile, check(path.wstring())) << path;
        EXPECT_EQ(Result::InputFileNotFound, check(wxString()));
        if (RunsOnWine()) // which follows a circle for ever
            continue;
        // A directory that runs in circles may be read or refused, as long as it ends.
        const int result = check(hostile.wstring());
        EXPECT_TRUE(result == Result::Success || result == Result::InvalidInputFile) << result;
    }
}

TEST_F(CompoundFileCheckTest, LeavesTheFileFree) {
    const auto path = m_folder.Write("a.doc", WordFile().Bytes()).wstring();
    ASSERT_EQ(Result::Success, CheckWordCompoundFile(path));
    ASSERT_EQ(Result::InvalidInputFile, CheckPublisherFile(path));
    const HANDLE alone = CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr,
                                     OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
    EXPECT_NE(INVALID_HANDLE_VALUE, alone);
    EXPECT_EQ(Result::InvalidInputFile, CheckWordCompoundFile(path)); // another program writes it
    CloseHandle(alone);
}

} // namespace
