#include "tests/support/CountedObject.h"

#include <afxdisp.h>

#include <gtest/gtest.h>

#include <string>

namespace {

constexpr DISPID Raising = 2;

/// Answers each call with a number, but for the one that raises an error.
class Callee : public CountedDispatch {
public:
    HRESULT STDMETHODCALLTYPE Invoke(DISPID member, REFIID /*reserved*/, LCID /*locale*/,
                                     WORD /*flags*/, DISPPARAMS* /*arguments*/, VARIANT* result,
                                     EXCEPINFO* exception, UINT* /*badArgument*/) override {
        if (member == Raising) {
            exception->pfnDeferredFillIn = [](EXCEPINFO* raised) {
                raised->bstrDescription = SysAllocString(L"no such page");
                raised->scode = E_INVALIDARG;
                return S_OK;
            };
            return DISP_E_EXCEPTION;
        }
        result->vt = VT_I2;
        result->iVal = 12;
        return S_OK;
    }
};

TEST(DispatchDriver, FailsWhereANumberStandsForAnObject) {
    Callee callee;
    COleDispatchDriver driver(&callee);
    LPDISPATCH object = nullptr;
    SCODE code = S_OK;
    try {
        driver.InvokeHelper(1, DISPATCH_METHOD, VT_DISPATCH, &object, nullptr);
    } catch (COleException* failure) {
        code = failure->m_sc;
        failure->Delete();
    }
    EXPECT_EQ(DISP_E_TYPEMISMATCH, code);
    EXPECT_EQ(nullptr, object);
}

TEST(DispatchDriver, ThrowsWhatTheApplicationRaised) {
    Callee callee;
    COleDispatchDriver driver(&callee);
    std::wstring description;
    SCODE code = S_OK;
    try {
        driver.InvokeHelper(Raising, DISPATCH_METHOD, VT_EMPTY, nullptr, nullptr);
    } catch (COleDispatchException* raised) {
        description = raised->m_strDescription;
        code = raised->m_scError;
        raised->Delete();
    }
    EXPECT_EQ(L"no such page", description);
    EXPECT_EQ(E_INVALIDARG, code);
}

TEST(DispatchDriver, OwnsAReference) {
    Callee callee;
    callee.AddRef(); // the test's own; the first one goes to the driver
    {
        COleDispatchDriver first(&callee);
        COleDispatchDriver second;
        second = first;
        // NOLINTNEXTLINE(performance-unnecessary-copy-initialization): the copy is what is tested
        const COleDispatchDriver third(second);
        EXPECT_EQ(4U, callee.References());
        second.ReleaseDispatch();
        EXPECT_EQ(nullptr, second.m_lpDispatch);
        EXPECT_EQ(3U, callee.References());
    }
    EXPECT_EQ(1U, callee.References());
}

} // namespace
