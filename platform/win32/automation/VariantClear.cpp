#include "platform/win32/automation/VariantTypes.h"

void WINAPI VariantInit(VARIANTARG* variant) {
    *variant = VARIANT{};
}

HRESULT WINAPI VariantClear(VARIANTARG* variant) {
    if (!win32::IsSupportedVariantType(variant->vt))
        return DISP_E_BADVARTYPE;
    const VARIANT cleared = *variant;
    *variant = VARIANT{};
    if (cleared.vt == VT_BSTR)
        SysFreeString(cleared.bstrVal);
    else if (cleared.vt == VT_DISPATCH && cleared.pdispVal)
        cleared.pdispVal->Release();
    return S_OK;
}
