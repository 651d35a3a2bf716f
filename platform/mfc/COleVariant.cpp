#include <afxdisp.h>

COleVariant::COleVariant() noexcept : VARIANT() {}

COleVariant::COleVariant(SHORT value) : VARIANT() {
    vt = VT_I2;
    iVal = value;
}

COleVariant::COleVariant(LONG value, VARTYPE type) : VARIANT() {
    vt = type;
    lVal = value;
}

COleVariant::COleVariant(LPCTSTR text) : VARIANT() {
    bstrVal = SysAllocString(text);
    if (text && !bstrVal)
        AfxThrowMemoryException();
    vt = VT_BSTR;
}

COleVariant::~COleVariant() {
    VariantClear(this);
}
