#include "office/AutomationScope.h"

#include "office/CompoundFileCheck.h"
#include "plugin/interface/ResultCodes.h"
#include "plugin/interface/WQPlugin.h"
#include "tests/filter/ComOnThisThread.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"

#include <afxwin.h>

#include <thread>

namespace {

enum class Mfc { Starts, Refuses, Throws };

Mfc g_mfc = Mfc::Starts;

} // namespace

// In the place of MFC's own.
BOOL AfxWinInit(HINSTANCE /*instance*/, HINSTANCE /*previous*/, LPTSTR /*commandLine*/,
                int /*show*/) {
    if (g_mfc == Mfc::Throws)
        AfxThrowMemoryException();
    return g_mfc == Mfc::Starts ? TRUE : FALSE;
}

namespace {

class AutomationScopeTest : public testing::Test {
protected:
    void TearDown() override { g_mfc = Mfc::Starts; }
};

TEST_F(AutomationScopeTest, GivesComToTheThreadForItsLife) {
    std::thread([] { // the first one may have COM from the toolkit
        ASSERT_FALSE(IsComInitialised());
        {
            const AutomationScope outer;
            EXPECT_TRUE(outer.IsComInitialised());
            { const AutomationScope inner; }
            EXPECT_TRUE(IsComInitialised());
        }
        EXPECT_FALSE(IsComInitialised());
    })
        .join();
}

TEST_F(AutomationScopeTest, SaysThatMfcRefusedAndLeavesComAlone) {
    const std::string message = "Fatal Error: MFC initialization failed\n";
    CoInitialize(nullptr);
    for (const Mfc refusal : {Mfc::Refuses, Mfc::Throws}) {
        g_mfc = refusal;
        testing::internal::CaptureStdout();
        EXPECT_FALSE(AutomationScope().IsComInitialised());
        EXPECT_EQ(message, testing::internal::GetCapturedStdout());
        testing::internal::CaptureStdout();
        InitializePlugin();
        InitializePlugin(); // the module does not ask again
        UninitializePlugin();
        EXPECT_EQ(message, testing::internal::GetCapturedStdout());
        EXPECT_TRUE(IsComInitialised()); // what the thread had is still there
    }
    CoUninitialize();
}

TEST_F(AutomationScopeTest, ExcelFilesAloneAreNotLookedAtWithoutMfc) {
    const TemporaryFolder folder;
    CompoundFile file;
    file.AddStream(u"Workbook", "cells");
    file.AddStream(u"WordDocument", "words");
    const std::wstring path = folder.Write("a.doc", file.Bytes()).wstring();
    EXPECT_EQ(Result::Success, CheckExcelCompoundFile(path));
    g_mfc = Mfc::Refuses;
    EXPECT_EQ(Result::InvalidInputFile, CheckExcelCompoundFile(path));
    EXPECT_EQ(Result::Success, CheckWordCompoundFile(path));
}

} // namespace
