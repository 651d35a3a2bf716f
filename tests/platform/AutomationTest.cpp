#include "tests/platform/CountedObject.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>

#include <string>

namespace {

VARIANT Of(SHORT value) {
    VARIANT variant{};
    variant.vt = VT_I2;
    variant.iVal = value;
    return variant;
}

VARIANT Of(LONG value, VARTYPE type = VT_I4) {
    VARIANT variant{};
    variant.vt = type;
    variant.lVal = value;
    return variant;
}

VARIANT Of(double value) {
    VARIANT variant{};
    variant.vt = VT_R8;
    variant.dblVal = value;
    return variant;
}

VARIANT Of(const std::wstring& text) {
    VARIANT variant{};
    variant.vt = VT_BSTR;
    variant.bstrVal = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
    return variant;
}

VARIANT OfBool(bool value) {
    VARIANT variant{};
    variant.vt = VT_BOOL;
    variant.boolVal = value ? VARIANT_TRUE : VARIANT_FALSE;
    return variant;
}

VARIANT OfType(VARTYPE type) {
    VARIANT variant{};
    variant.vt = type;
    return variant;
}

std::wstring TextOf(BSTR text) {
    return {text, SysStringLen(text)};
}

bool Equal(const VARIANT& left, const VARIANT& right) {
    if (left.vt != right.vt)
        return false;
    switch (left.vt) {
    case VT_I2:
    case VT_BOOL:
        return left.iVal == right.iVal;
    case VT_I4:
    case VT_ERROR:
        return left.lVal == right.lVal;
    case VT_R8:
        return left.dblVal == right.dblVal;
    case VT_BSTR:
        return TextOf(left.bstrVal) == TextOf(right.bstrVal);
    default:
        return left.vt == VT_EMPTY || left.vt == VT_NULL;
    }
}

TEST(Bstr, CarriesItsLength) {
    const std::wstring text(L"a\0b", 3);
    BSTR bstr = SysAllocStringLen(text.data(), 3);
    ASSERT_NE(nullptr, bstr);
    EXPECT_EQ(3U, SysStringLen(bstr));
    EXPECT_EQ(3 * sizeof(OLECHAR), SysStringByteLen(bstr));
    EXPECT_EQ(text, TextOf(bstr));
    EXPECT_EQ(L'\0', bstr[3]);
    SysFreeString(bstr);

    bstr = SysAllocString(L"");
    ASSERT_NE(nullptr, bstr);
    EXPECT_EQ(0U, SysStringLen(bstr));
    SysFreeString(bstr);
    EXPECT_EQ(nullptr, SysAllocString(nullptr));
    EXPECT_EQ(0U, SysStringLen(nullptr)); // as good as an empty text
    EXPECT_EQ(nullptr, SysAllocStringLen(nullptr, 0xFFFFFFFFU));
    SysFreeString(nullptr);
}

TEST(Variant, ClearingLetsGoOfWhatItOwns) {
    CountedObject object;
    object.AddRef();
    VARIANT variant = OfType(VT_UNKNOWN);
    variant.punkVal = &object;
    EXPECT_EQ(S_OK, VariantClear(&variant));
    EXPECT_EQ(VT_EMPTY, variant.vt);
    EXPECT_EQ(0U, object.references);

    object.AddRef();
    IUnknown* pointer = &object;
    variant.vt = VT_UNKNOWN | VT_BYREF;
    variant.byref = &pointer;
    EXPECT_EQ(S_OK, VariantClear(&variant)); // a reference owns nothing
    EXPECT_EQ(1U, object.references);

    variant.vt = 0x0FFF;
    EXPECT_EQ(DISP_E_BADVARTYPE, VariantClear(&variant));
    EXPECT_EQ(0x0FFF, variant.vt);
}

TEST(Variant, ACopyStandsByItself) {
    VARIANT text = Of(std::wstring(L"a\0b", 3));
    VARIANT copy{};
    VariantInit(&copy);
    ASSERT_EQ(S_OK, VariantCopy(&copy, &text));
    EXPECT_NE(text.bstrVal, copy.bstrVal);
    EXPECT_TRUE(Equal(text, copy));
    ASSERT_EQ(S_OK, VariantCopy(&copy, &copy));
    EXPECT_TRUE(Equal(text, copy));

    CountedObject object;
    VARIANT lent = OfType(VT_UNKNOWN);
    lent.punkVal = &object;
    ASSERT_EQ(S_OK, VariantCopy(&copy, &lent));
    EXPECT_EQ(1U, object.references);
    VARIANT bad = OfType(0x0FFF);
    EXPECT_EQ(DISP_E_BADVARTYPE, VariantCopy(&copy, &bad));
    EXPECT_EQ(S_OK, VariantClear(&copy));
    EXPECT_EQ(0U, object.references);
    EXPECT_EQ(S_OK, VariantClear(&text));
}

TEST(Variant, ACopyThroughAReferenceHoldsTheValue) {
    VARIANT text = Of(L"words");
    VARIANT toText = OfType(VT_BSTR | VT_BYREF);
    toText.byref = &text.bstrVal;
    VARIANT toVariant = OfType(VT_VARIANT | VT_BYREF);
    toVariant.pvarVal = &text;
    VARIANT toReference = toVariant;
    toReference.pvarVal = &toText;
    for (VARIANT reference : {toText, toVariant, toReference}) {
        VARIANT copy{};
        ASSERT_EQ(S_OK, VariantCopyInd(&copy, &reference));
        EXPECT_TRUE(Equal(text, copy));
        EXPECT_NE(text.bstrVal, copy.bstrVal);
        VariantClear(&copy);
    }
    VARIANT chain = OfType(VT_VARIANT | VT_BYREF);
    chain.pvarVal = &toVariant;
    VARIANT copy{};
    EXPECT_EQ(E_INVALIDARG, VariantCopyInd(&copy, &chain));
    VariantClear(&text);
}

TEST(Variant, ChangesItsType) {
    struct Case {
        VARIANT source;
        VARTYPE type;
        HRESULT result;
        VARIANT expected;
    };
    const VARIANT none{};
    Case cases[] = {
        {Of(SHORT{-7}), VT_I4, S_OK, Of(LONG{-7})},
        {Of(LONG{32768}), VT_I2, DISP_E_OVERFLOW, none},
        {Of(LONG{-32768}), VT_I2, S_OK, Of(SHORT{-32768})},
        {Of(LONG{-12}), VT_BSTR, S_OK, Of(L"-12")},
        {Of(LONG{2}), VT_BOOL, S_OK, OfBool(true)},
        {OfBool(true), VT_I2, S_OK, Of(SHORT{-1})},
        {OfBool(true), VT_I4, S_OK, Of(LONG{-1})},
        {OfBool(true), VT_BSTR, S_OK, Of(L"-1")},
        {Of(2.5), VT_I4, S_OK, Of(LONG{2})}, // halves go to the even number
        {Of(3.5), VT_I2, S_OK, Of(SHORT{4})},
        {Of(2147483647.5), VT_I4, DISP_E_OVERFLOW, none},
        {Of(0.25), VT_BSTR, S_OK, Of(L"0.25")},
        {Of(1e20), VT_BSTR, S_OK, Of(L"1E+20")},
        {Of(L" 42 "), VT_I4, S_OK, Of(LONG{42})},
        {Of(L"-1.5e1"), VT_R8, S_OK, Of(-15.0)},
        {Of(L"70000"), VT_I2, DISP_E_OVERFLOW, none},
        {Of(L"four"), VT_I4, DISP_E_TYPEMISMATCH, none},
        {Of(L"nan"), VT_R8, DISP_E_TYPEMISMATCH, none},
        {Of(L""), VT_I2, DISP_E_TYPEMISMATCH, none},
        {Of(L"TRUE"), VT_BOOL, S_OK, OfBool(true)},
        {Of(L"false"), VT_BOOL, S_OK, OfBool(false)},
        {Of(L"0"), VT_BOOL, S_OK, OfBool(false)},
        {Of(L"maybe"), VT_BOOL, DISP_E_TYPEMISMATCH, none},
        {none, VT_I4, S_OK, Of(LONG{0})},
        {none, VT_BSTR, S_OK, Of(L"")},
        {OfType(VT_NULL), VT_I4, DISP_E_TYPEMISMATCH, none},
        {Of(DISP_E_PARAMNOTFOUND, VT_ERROR), VT_I4, DISP_E_TYPEMISMATCH, none},
        {Of(DISP_E_PARAMNOTFOUND, VT_ERROR), VT_ERROR, S_OK, Of(DISP_E_PARAMNOTFOUND, VT_ERROR)},
        {Of(LONG{1}), 0x0FFF, DISP_E_BADVARTYPE, none},
    };
    for (Case& expected : cases) {
        VARIANT target{};
        EXPECT_EQ(expected.result, VariantChangeType(&target, &expected.source, 0, expected.type))
            << "case " << &expected - cases;
        EXPECT_TRUE(Equal(expected.expected, target)) << "case " << &expected - cases;
        VariantClear(&target);
        // In place, as most callers have it.
        EXPECT_EQ(expected.result,
                  VariantChangeType(&expected.source, &expected.source, 0, expected.type));
        VariantClear(&expected.source);
        VariantClear(&expected.expected);
    }
}

} // namespace
