#include "office/AutomationScope.h"

#include "office/CompoundFileCheck.h"
#include "plugin/ResultCodes.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"

#include <afxwin.h>
#include <objbase.h>

#include <gtest/gtest.h>

namespace {

bool g_mfcRefuses = false;

HRESULT CreateUnknownClass() {
    const CLSID unknown{0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};
    void* object = nullptr;
    return CoCreateInstance(unknown, nullptr, CLSCTX_INPROC_SERVER, IID_IUnknown, &object);
}

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
    ASSERT_EQ(CO_E_NOTINITIALIZED, CreateUnknownClass());
    {
        const AutomationScope outer;
        EXPECT_TRUE(outer.IsComInitialised());
        {
            const AutomationScope inner;
            EXPECT_EQ(REGDB_E_CLASSNOTREG, CreateUnknownClass());
        }
        EXPECT_EQ(REGDB_E_CLASSNOTREG, CreateUnknownClass());
    }
    EXPECT_EQ(CO_E_NOTINITIALIZED, CreateUnknownClass());
}

TEST_F(AutomationScopeTest, SaysThatMfcRefusedAndLeavesComAlone) {
    g_mfcRefuses = true;
    CoInitialize(nullptr);
    testing::internal::CaptureStdout();
    {
        const AutomationScope scope;
        EXPECT_FALSE(scope.IsComInitialised());
    }
    EXPECT_EQ("Fatal Error: MFC initialization failed\n", testing::internal::GetCapturedStdout());
    EXPECT_EQ(REGDB_E_CLASSNOTREG, CreateUnknownClass()); // what the thread had is still there
    CoUninitialize();
}

TEST_F(AutomationScopeTest, ExcelFilesAloneAreNotLookedAtWithoutMfc) {
    const TemporaryFolder folder;
    CompoundFile workbook;
    workbook.AddStream(u"Workbook", "cells");
    CompoundFile document;
    document.AddStream(u"WordDocument", "words");
    const auto xls = folder.Write("a.xls", workbook.Bytes());
    const auto doc = folder.Write("a.doc", document.Bytes());
    ASSERT_EQ(Result::Success, CheckExcelCompoundFile(xls.wstring()));

    g_mfcRefuses = true;
    testing::internal::CaptureStdout();
    EXPECT_EQ(Result::InvalidInputFile, CheckExcelCompoundFile(xls.wstring()));
    EXPECT_EQ(Result::Success, CheckWordCompoundFile(doc.wstring()));
    testing::internal::GetCapturedStdout();
}

} // namespace
