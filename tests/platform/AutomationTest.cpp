#include "tests/support/CountedObject.h"

#include <ole2.h>

#include <gtest/gtest.h>

#include <string>

namespace {

const std::wstring Zeroed(L"a\0b", 3); // as only a text with a length can be
constexpr VARTYPE Unknown = 0x0FFF;

class Object final : public CountedDispatch {
public:
    HRESULT STDMETHODCALLTYPE Invoke(DISPID /*member*/, REFIID /*reserved*/, LCID /*locale*/,
                                     WORD /*flags*/, DISPPARAMS* /*arguments*/, VARIANT* /*result*/,
                                     EXCEPINFO* /*exception*/, UINT* /*badArgument*/) override {
        return E_NOTIMPL;
    }
};

VARIANT Short(SHORT value) {
    VARIANT variant{};
    variant.vt = VT_I2;
    variant.iVal = value;
    return variant;
}

VARIANT Yes() {
    VARIANT variant{};
    variant.vt = VT_BOOL;
    variant.boolVal = VARIANT_TRUE;
    return variant;
}

VARIANT Long(LONG value, VARTYPE type = VT_I4) {
    VARIANT variant{};
    variant.vt = type;
    variant.lVal = value;
    return variant;
}

VARIANT Text(const std::wstring& text) {
    VARIANT variant{};
    variant.vt = VT_BSTR;
    variant.bstrVal = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
    return variant;
}

std::wstring TextOf(BSTR text) {
    return {text, SysStringLen(text)};
}

/// The value, whatever its type; empty for a variant without one.
std::wstring ValueOf(const VARIANT& variant) {
    switch (variant.vt) {
    case VT_I2:
        return std::to_wstring(variant.iVal);
    case VT_BOOL:
        return variant.boolVal == VARIANT_TRUE ? L"true" : std::to_wstring(variant.boolVal);
    case VT_I4:
    case VT_ERROR:
        return std::to_wstring(variant.lVal);
    case VT_BSTR:
        return TextOf(variant.bstrVal);
    default:
        return {};
    }
}

TEST(Bstr, CarriesItsLength) {
    BSTR text = SysAllocStringLen(Zeroed.data(), 3);
    ASSERT_NE(nullptr, text);
    EXPECT_EQ(Zeroed, TextOf(text));
    EXPECT_EQ(3U, SysStringLen(text));
    EXPECT_EQ(L'\0', text[3]);
    SysFreeString(text);

    text = SysAllocString(L"");
    EXPECT_NE(nullptr, text);
    SysFreeString(text);
    EXPECT_EQ(nullptr, SysAllocString(nullptr));
    EXPECT_EQ(nullptr, SysAllocStringLen(nullptr, 0xFFFFFFFFU));
    EXPECT_EQ(0U, SysStringLen(nullptr)); // as good as an empty text
    SysFreeString(nullptr);
}

TEST(Variant, OwnsItsObjectAndNotWhatItRefersTo) {
    Object object;
    VARIANT variant{};
    variant.vt = VT_DISPATCH;
    variant.pdispVal = &object;
    object.AddRef();
    VARIANT reference{};
    reference.vt = VT_VARIANT | VT_BYREF;
    reference.pvarVal = &variant;
    EXPECT_EQ(S_OK, VariantClear(&reference));
    EXPECT_EQ(2U, object.References());
    EXPECT_EQ(S_OK, VariantClear(&variant));
    EXPECT_EQ(VT_EMPTY, variant.vt);
    EXPECT_EQ(1U, object.References());

    variant.vt = Unknown;
    EXPECT_EQ(DISP_E_BADVARTYPE, VariantClear(&variant));
    EXPECT_EQ(Unknown, variant.vt);
}

TEST(Variant, ACopyHasATextOfItsOwn) {
    VARIANT text = Text(Zeroed);
    VARIANT copy{};
    ASSERT_EQ(S_OK, VariantChangeType(&copy, &text, 0, VT_BSTR));
    EXPECT_NE(text.bstrVal, copy.bstrVal);
    VariantClear(&text);
    EXPECT_EQ(VT_BSTR, copy.vt);
    EXPECT_EQ(Zeroed, TextOf(copy.bstrVal));
    ASSERT_EQ(S_OK, VariantChangeType(&copy, &copy, 0, VT_BSTR));
    EXPECT_EQ(Zeroed, TextOf(copy.bstrVal));
    VariantClear(&copy);
}

TEST(Variant, ChangesItsType) {
    struct {
        VARIANT source;
        VARTYPE type;
        HRESULT result;
        std::wstring expected;
    } cases[] = {
        {Short(-7), VT_I4, S_OK, L"-7"},
        {Long(32768), VT_I2, DISP_E_OVERFLOW, L""},
        {Long(-32768), VT_I2, S_OK, L"-32768"},
        {Long(-12), VT_BSTR, S_OK, L"-12"},
        {Long(2), VT_BOOL, S_OK, L"true"},
        {Yes(), VT_I2, S_OK, L"-1"},
        {Yes(), VT_I4, S_OK, L"-1"},
        {Yes(), VT_BSTR, S_OK, L"-1"},
        {Text(L" 42 "), VT_I4, S_OK, L"42"},
        {Text(L"-1.5e1"), VT_I4, S_OK, L"-15"},
        {Text(L"2.5"), VT_I4, S_OK, L"2"}, // halves go to the even number
        {Text(L"3.5"), VT_I2, S_OK, L"4"},
        {Text(L"2147483647.5"), VT_I4, DISP_E_OVERFLOW, L""},
        {Text(L"70000"), VT_I2, DISP_E_OVERFLOW, L""},
        {Text(L"four"), VT_I4, DISP_E_TYPEMISMATCH, L""},
        {Text(L"nan"), VT_I4, DISP_E_TYPEMISMATCH, L""},
        {Text(L""), VT_I2, DISP_E_TYPEMISMATCH, L""},
        {Text(L"TRUE"), VT_BOOL, S_OK, L"true"},
        {Text(L"false"), VT_BOOL, S_OK, L"0"},
        {Text(L"0"), VT_BOOL, S_OK, L"0"},
        {Text(L"maybe"), VT_BOOL, DISP_E_TYPEMISMATCH, L""},
        {VARIANT{}, VT_I4, S_OK, L"0"},
        {VARIANT{}, VT_BSTR, S_OK, L""},
        {Long(DISP_E_PARAMNOTFOUND, VT_ERROR), VT_I4, DISP_E_TYPEMISMATCH, L""},
        {Long(7, VT_ERROR), VT_ERROR, S_OK, L"7"},
        {Long(1), Unknown, DISP_E_BADVARTYPE, L""},
    };
    for (auto& expected : cases) {
        VARIANT target{};
        EXPECT_EQ(expected.result, VariantChangeType(&target, &expected.source, 0, expected.type))
            << "case " << &expected - cases;
        EXPECT_EQ(SUCCEEDED(expected.result) ? expected.type : VARTYPE{VT_EMPTY}, target.vt);
        EXPECT_EQ(expected.expected, ValueOf(target)) << "case " << &expected - cases;
        VariantClear(&target);
        // In place, as most callers have it.
        EXPECT_EQ(expected.result,
                  VariantChangeType(&expected.source, &expected.source, 0, expected.type));
        VariantClear(&expected.source);
    }
}

} // namespace
