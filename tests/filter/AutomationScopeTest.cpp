#include "office/AutomationScope.h"

#include "office/CompoundFileCheck.h"
#include "plugin/ResultCodes.h"
#include "tests/filter/ComOnThisThread.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"

#include <afxwin.h>

namespace {

bool g_mfcRefuses = false;

} // namespace

// In the place of MFC's own.
BOOL AfxWinInit(HINSTANCE /*instance*/, HINSTANCE /*previous*/, LPTSTR /*commandLine*/,
                int /*show*/) {
    return g_mfcRefuses ? FALSE : TRUE;
}

namespace {

class AutomationScopeTest : public testing::Test {
protected:
    void TearDown() override { g_mfcRefuses = false; }
};

TEST_F(AutomationScopeTest, GivesComToTheThreadForItsLife) {
    ASSERT_FALSE(IsComInitialised());
    {
        const AutomationScope outer;
        EXPECT_TRUE(outer.IsComInitialised());
        { const AutomationScope inner; }
        EXPECT_TRUE(IsComInitialised());
    }
    EXPECT_FALSE(IsComInitialised());
}

TEST_F(AutomationScopeTest, SaysThatMfcRefusedAndLeavesComAlone) {
    g_mfcRefuses = true;
    CoInitialize(nullptr);
    testing::internal::CaptureStdout();
    EXPECT_FALSE(AutomationScope().IsComInitialised());
    EXPECT_EQ("Fatal Error: MFC initialization failed\n", testing::internal::GetCapturedStdout());
    EXPECT_TRUE(IsComInitialised()); // what the thread had is still there
    CoUninitialize();
}

TEST_F(AutomationScopeTest, ExcelFilesAloneAreNotLookedAtWithoutMfc) {
    const TemporaryFolder folder;
    CompoundFile file;
    file.AddStream(u"Workbook", "cells");
    file.AddStream(u"WordDocument", "words");
    const std::wstring path = folder.Write("a.doc", file.Bytes()).wstring();
    EXPECT_EQ(Result::Success, CheckExcelCompoundFile(path));
    g_mfcRefuses = true;
    EXPECT_EQ(Result::InvalidInputFile, CheckExcelCompoundFile(path));
    EXPECT_EQ(Result::Success, CheckWordCompoundFile(path));
}

} // namespace
