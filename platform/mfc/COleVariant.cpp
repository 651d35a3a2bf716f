#include <afxdisp.h>

COleVariant::COleVariant() noexcept : VARIANT() {}

COleVariant::COleVariant(SHORT value, VARTYPE type) : VARIANT() {
    vt = type;
    if (type == VT_BOOL)
        boolVal = value ? VARIANT_TRUE : VARIANT_FALSE;
    else
        iVal = value;
}

COleVariant::COleVariant(LONG value, VARTYPE type) : VARIANT() {
    vt = type;
    if (type == VT_BOOL)
        boolVal = value ? VARIANT_TRUE : VARIANT_FALSE;
    else
        lVal = value;
}

COleVariant::COleVariant(LPCTSTR text, VARTYPE type) : VARIANT() {
    vt = type;
    bstrVal = SysAllocString(text);
    if (text && !bstrVal) {
        vt = VT_EMPTY;
        AfxThrowMemoryException();
    }
}

// NOLINTNEXTLINE(bugprone-copy-constructor-init): the contents are copied below, with ownership
COleVariant::COleVariant(const COleVariant& other) : VARIANT() {
    *this = other;
}

COleVariant& COleVariant::operator=(const COleVariant& other) {
    // Only read from; some editions of the header have forgotten to say so.
    auto* const source = const_cast<COleVariant*>(&other);
    const HRESULT result = this == &other ? S_OK : VariantCopy(this, source);
    if (FAILED(result))
        AfxThrowOleException(result);
    return *this;
}

COleVariant::~COleVariant() {
    VariantClear(this);
}

void COleVariant::Clear() {
    VariantClear(this);
}
