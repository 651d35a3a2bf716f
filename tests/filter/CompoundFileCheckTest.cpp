#include "office/CompoundFileCheck.h"

#include "plugin/ResultCodes.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <windows.h>

#include <gtest/gtest.h>

namespace {

using Check = int (*)(const wxString&);

constexpr Check AllChecks[] = {CheckWordCompoundFile, CheckExcelCompoundFile,
                               CheckPowerPointCompoundFile, CheckPublisherFile};

TEST(CompoundFileCheck, TakesADocumentByItsStream) {
    const struct {
        const char16_t* stream;
        Check check;
    } cases[] = {
        {u"WordDocument", CheckWordCompoundFile},
        {u"Workbook", CheckExcelCompoundFile},
        {u"Book", CheckExcelCompoundFile},
        {u"PowerPoint Document", CheckPowerPointCompoundFile},
        {u"PP40", CheckPowerPointCompoundFile},
        {u"Contents", CheckPublisherFile},
    };
    const TemporaryFolder folder;
    for (const auto& expected : cases) {
        CompoundFile file;
        file.AddStream(u"Other", "x");
        file.AddStream(expected.stream, std::string(5000, 'd'));
        const auto path = folder.Write("document", file.Bytes());
        for (const Check check : AllChecks)
            EXPECT_EQ(check == expected.check ? Result::Success : Result::InvalidInputFile,
                      check(path.wstring()))
                << "case " << &expected - cases;
    }
}

TEST(CompoundFileCheck, RefusesWhatIsNoCompoundFile) {
    const TemporaryFolder folder;
    CompoundFile good;
    good.AddStream(u"WordDocument", std::string(5000, 'd'));
    const std::string bytes = good.Bytes();
    CompoundFile cyclic = good;
    cyclic.MakeDirectoryCyclic();

    const std::filesystem::path paths[] = {
        folder.Write("empty.doc", ""),
        folder.Write("zip.doc", "PK\x03\x04 and the rest of a package"),
        folder.Write("noise.doc", std::string(3000, '\x5a')),
        folder.Write("header only.doc", bytes.substr(0, 512)),
        folder / "missing.doc",
        folder.Path(),
    };
    for (const auto& path : paths)
        for (const Check check : AllChecks)
            EXPECT_EQ(Result::InvalidInputFile, check(path.wstring())) << path;

    if (RunsOnWine()) // which follows a circle for ever
        return;
    // A directory that runs in circles may be read or refused, as long as it ends.
    const auto hostile = folder.Write("cyclic.doc", cyclic.Bytes());
    for (const Check check : AllChecks) {
        const int result = check(hostile.wstring());
        EXPECT_TRUE(result == Result::Success || result == Result::InvalidInputFile) << result;
    }
}

TEST(CompoundFileCheck, AnswersAnEmptyPathByItself) {
    for (const Check check : AllChecks)
        EXPECT_EQ(Result::InputFileNotFound, check(wxString()));
}

TEST(CompoundFileCheck, LeavesTheFileFree) {
    const TemporaryFolder folder;
    CompoundFile file;
    file.AddStream(u"WordDocument", "words");
    const std::wstring path = folder.Write("a.doc", file.Bytes()).wstring();
    ASSERT_EQ(Result::Success, CheckWordCompoundFile(path));
    ASSERT_EQ(Result::InvalidInputFile, CheckPublisherFile(path));
    const HANDLE alone = CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr,
                                     OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
    EXPECT_NE(INVALID_HANDLE_VALUE, alone);
    EXPECT_EQ(Result::InvalidInputFile, CheckWordCompoundFile(path)); // another program writes it
    CloseHandle(alone);
}

} // namespace
