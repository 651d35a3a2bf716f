#include <afxdisp.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace {

/// A dispatch object that notes the last call and answers what the test says.
class Callee : public IDispatch {
public:
    Callee() = default;
    virtual ~Callee() { VariantClear(&answer); }
    Callee(const Callee&) = delete;
    Callee& operator=(const Callee&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID /*iid*/, void** object) override {
        *object = nullptr;
        return E_NOINTERFACE;
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return ++references; }
    ULONG STDMETHODCALLTYPE Release() override { return --references; }
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* /*count*/) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT /*index*/, LCID /*locale*/,
                                          ITypeInfo** /*info*/) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID /*iid*/, LPOLESTR* /*names*/, UINT /*count*/,
                                            LCID /*locale*/, DISPID* /*ids*/) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE Invoke(DISPID calledMember, REFIID /*iid*/, LCID /*locale*/,
                                     WORD calledFlags, DISPPARAMS* arguments, VARIANT* answered,
                                     EXCEPINFO* exception, UINT* /*badArgument*/) override {
        member = calledMember;
        flags = calledFlags;
        hasResult = answered != nullptr;
        isNamedPut =
            arguments->cNamedArgs == 1 && arguments->rgdispidNamedArgs[0] == DISPID_PROPERTYPUT;
        if (check)
            check(*arguments);
        if (result == DISP_E_EXCEPTION) {
            exception->wCode = 17;
            exception->bstrSource = SysAllocString(L"Microsoft Word");
            exception->bstrDescription = SysAllocString(L"The file is corrupt.");
        }
        if (answered)
            VariantCopy(answered, &answer);
        return result;
    }

    ULONG references = 1;
    HRESULT result = S_OK;
    VARIANT answer{};
    std::function<void(const DISPPARAMS&)> check;
    DISPID member = 0;
    WORD flags = 0;
    bool hasResult = false;
    bool isNamedPut = false;
};

/// What `call` throws; null when it throws nothing.
template <typename Exception, typename Call>
auto Thrown(Call call) {
    struct Deleter {
        void operator()(Exception* exception) const { exception->Delete(); }
    };
    using Pointer = std::unique_ptr<Exception, Deleter>;
    try {
        call();
    } catch (Exception* exception) { // NOLINT(misc-throw-by-value-catch-by-reference): as MFC does
        return Pointer(exception);
    }
    return Pointer();
}

const BYTE* Types(const char* codes) {
    return reinterpret_cast<const BYTE*>(codes);
}

TEST(DispatchDriver, PassesArgumentsLastFirst) {
    Callee callee;
    COleDispatchDriver driver(&callee, FALSE);
    VARIANT omitted{};
    omitted.vt = VT_ERROR;
    omitted.scode = DISP_E_PARAMNOTFOUND;
    bool called = false;
    callee.check = [&](const DISPPARAMS& call) {
        called = true;
        ASSERT_EQ(6U, call.cArgs);
        EXPECT_EQ(0U, call.cNamedArgs);
        const VARIANT* last = call.rgvarg;
        EXPECT_EQ(VT_VARIANT | VT_BYREF, last[0].vt);
        EXPECT_EQ(&omitted, last[0].pvarVal);
        EXPECT_EQ(VT_ERROR, last[1].vt);
        EXPECT_EQ(DISP_E_PARAMNOTFOUND, last[1].scode);
        EXPECT_EQ(VT_BOOL, last[2].vt);
        EXPECT_EQ(VARIANT_TRUE, last[2].boolVal);
        EXPECT_EQ(VT_I4, last[3].vt);
        EXPECT_EQ(-70000, last[3].lVal);
        EXPECT_EQ(VT_I2, last[4].vt);
        EXPECT_EQ(-3, last[4].iVal);
        EXPECT_EQ(VT_BSTR, last[5].vt);
        EXPECT_STREQ(L"C:\\in.doc", last[5].bstrVal);
        EXPECT_EQ(9U, SysStringLen(last[5].bstrVal));
    };
    driver.InvokeHelper(15, DISPATCH_METHOD, VT_EMPTY, nullptr,
                        Types(VTS_BSTR VTS_I2 VTS_I4 VTS_BOOL VTS_VARIANT VTS_PVARIANT),
                        L"C:\\in.doc", -3, LONG{-70000}, 1, &omitted, &omitted);
    EXPECT_TRUE(called);
    EXPECT_EQ(15, callee.member);
    EXPECT_EQ(DISPATCH_METHOD, callee.flags);
    EXPECT_FALSE(callee.hasResult);
}

TEST(DispatchDriver, NamesTheValueOfAPropertyPut) {
    Callee callee;
    COleDispatchDriver driver(&callee, FALSE);
    driver.InvokeHelper(3, DISPATCH_PROPERTYPUT, VT_EMPTY, nullptr, Types(VTS_I4), LONG{1});
    EXPECT_TRUE(callee.isNamedPut);
    driver.InvokeHelper(3, DISPATCH_METHOD, VT_EMPTY, nullptr, nullptr);
    EXPECT_FALSE(callee.isNamedPut);
}

TEST(DispatchDriver, HandsResultsOverInTheTypeAskedFor) {
    Callee other; // outlives the one that answers it
    Callee callee;
    COleDispatchDriver driver(&callee, FALSE);
    callee.answer = COleVariant(SHORT{12});
    LONG number = 0;
    driver.InvokeHelper(1, DISPATCH_PROPERTYGET, VT_I4, &number, nullptr);
    EXPECT_EQ(12, number);
    BOOL flag = FALSE;
    driver.InvokeHelper(1, DISPATCH_PROPERTYGET, VT_BOOL, &flag, nullptr);
    EXPECT_EQ(TRUE, flag);
    BSTR text = nullptr;
    driver.InvokeHelper(1, DISPATCH_PROPERTYGET, VT_BSTR, &text, nullptr);
    EXPECT_STREQ(L"12", text);
    SysFreeString(text);

    callee.answer.vt = VT_DISPATCH;
    callee.answer.pdispVal = &other; // takes the first reference; its copy is the caller's
    LPDISPATCH object = nullptr;
    driver.InvokeHelper(1, DISPATCH_PROPERTYGET, VT_DISPATCH, &object, nullptr);
    EXPECT_EQ(&other, object);
    EXPECT_EQ(2U, other.references);
    object->Release();
    callee.answer = {};
    callee.answer.vt = VT_NULL;
    const auto failure = Thrown<COleException>(
        [&] { driver.InvokeHelper(1, DISPATCH_PROPERTYGET, VT_I4, &number, nullptr); });
    ASSERT_TRUE(failure);
    EXPECT_EQ(DISP_E_TYPEMISMATCH, failure->m_sc);
}

TEST(DispatchDriver, ThrowsWhatTheApplicationRaised) {
    Callee callee;
    COleDispatchDriver driver(&callee, FALSE);
    const auto call = [&] { driver.InvokeHelper(1, DISPATCH_METHOD, VT_EMPTY, nullptr, nullptr); };
    callee.result = DISP_E_EXCEPTION;
    const auto raised = Thrown<COleDispatchException>(call);
    ASSERT_TRUE(raised);
    EXPECT_EQ(17, raised->m_wCode);
    EXPECT_STREQ(L"Microsoft Word", raised->m_strSource);
    wchar_t message[9] = {};
    EXPECT_TRUE(raised->GetErrorMessage(message, 9));
    EXPECT_STREQ(L"The file", message); // cut to fit

    callee.result = DISP_E_MEMBERNOTFOUND;
    const auto failed = Thrown<CException>(call); // what a caller may catch for all of them
    const auto* failure = dynamic_cast<COleException*>(failed.get());
    ASSERT_TRUE(failure);
    EXPECT_EQ(DISP_E_MEMBERNOTFOUND, failure->m_sc);
}

TEST(DispatchDriver, OwnsAReference) {
    Callee callee;
    {
        COleDispatchDriver first(&callee);
        COleDispatchDriver second;
        second = first;
        const COleDispatchDriver third(
            second); // NOLINT(performance-unnecessary-copy-initialization)
        EXPECT_EQ(3U, callee.references);
        second.ReleaseDispatch();
        EXPECT_EQ(nullptr, second.m_lpDispatch);
        EXPECT_EQ(2U, callee.references);
        EXPECT_EQ(&callee, first.DetachDispatch());
    }
    EXPECT_EQ(1U, callee.references);
}

TEST(DispatchDriver, TellsWhyNoApplicationCanBeStarted) {
    COleDispatchDriver driver;
    COleException error;
    ASSERT_EQ(S_OK, CoInitialize(nullptr));
    EXPECT_FALSE(driver.CreateDispatch(L"QuillonTest.None", &error));
    EXPECT_EQ(CO_E_CLASSSTRING, error.m_sc);
    EXPECT_FALSE(driver.CreateDispatch(L"QuillonTest.None"));
    CoUninitialize();
}

TEST(OleVariant, CopiesAndClearsItself) {
    const COleVariant text(L"words");
    COleVariant copy(text);
    EXPECT_NE(text.bstrVal, copy.bstrVal);
    EXPECT_STREQ(L"words", copy.bstrVal);
    copy = COleVariant(SHORT{1}, VT_BOOL);
    EXPECT_EQ(VARIANT_TRUE, copy.boolVal);
    copy.Clear();
    EXPECT_EQ(VT_EMPTY, copy.vt);
    EXPECT_EQ(VT_ERROR, COleVariant(DISP_E_PARAMNOTFOUND, VT_ERROR).vt);
}

TEST(Mfc, SwitchesTheModuleStateForAScope) {
    AFX_MODULE_STATE* const before = AfxGetModuleState();
    {
        const AFX_MAINTAIN_STATE2 scope(AfxGetStaticModuleState());
        EXPECT_EQ(AfxGetStaticModuleState(), AfxGetModuleState());
    }
    EXPECT_EQ(before, AfxGetModuleState());
    EXPECT_TRUE(AfxWinInit(GetModuleHandleW(nullptr), nullptr, GetCommandLineW(), 0));
    EXPECT_TRUE(AfxWinInit(GetModuleHandleW(nullptr), nullptr, GetCommandLineW(), 0));
}

TEST(Mfc, NewBytesOfAnArrayAreZero) {
    CByteArray bytes;
    bytes.SetSize(2);
    bytes.GetData()[0] = 9;
    bytes.SetSize(1480);
    EXPECT_EQ(9, bytes.GetData()[0]);
    EXPECT_EQ(0, bytes.GetData()[1479]);
    bytes.RemoveAll();
    EXPECT_EQ(0, bytes.GetSize());
}

} // namespace
