#include "platform/win32/automation/VariantTypes.h"

#include <cstring>

namespace {

/// Gives the variant, which is a plain copy of another, its own text or reference.
HRESULT OwnContents(VARIANT& variant) {
    switch (variant.vt) {
    case VT_BSTR:
        if (variant.bstrVal) {
            variant.bstrVal = SysAllocStringLen(variant.bstrVal, SysStringLen(variant.bstrVal));
            return variant.bstrVal ? S_OK : E_OUTOFMEMORY;
        }
        return S_OK;
    case VT_DISPATCH:
    case VT_UNKNOWN:
        if (variant.punkVal)
            variant.punkVal->AddRef();
        return S_OK;
    default:
        return S_OK;
    }
}

/// The value that a reference refers to, still the owner's.
HRESULT Dereference(const VARIANT& reference, VARIANT& value) {
    value = VARIANT{};
    value.vt = reference.vt & ~VT_BYREF;
    switch (value.vt) {
    case VT_I2:
    case VT_BOOL:
        std::memcpy(&value.iVal, reference.byref, sizeof value.iVal);
        return S_OK;
    case VT_I4:
    case VT_ERROR:
        std::memcpy(&value.lVal, reference.byref, sizeof value.lVal);
        return S_OK;
    default: // the others fill the whole union
        std::memcpy(&value.dblVal, reference.byref, sizeof value.dblVal);
        return S_OK;
    case VT_VARIANT:
        value = *reference.pvarVal;
        if (!win32::IsSupportedVariantType(value.vt))
            return DISP_E_BADVARTYPE;
        if (value.vt == (VT_VARIANT | VT_BYREF))
            return E_INVALIDARG; // one step is followed, not a chain of them
        return value.vt & VT_BYREF ? Dereference(VARIANT(value), value) : S_OK;
    }
}

} // namespace

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
    else if ((cleared.vt == VT_DISPATCH || cleared.vt == VT_UNKNOWN) && cleared.punkVal)
        cleared.punkVal->Release();
    return S_OK;
}

HRESULT WINAPI VariantCopy(VARIANTARG* target, const VARIANTARG* source) {
    if (target == source)
        return S_OK;
    if (!win32::IsSupportedVariantType(source->vt))
        return DISP_E_BADVARTYPE;
    const HRESULT cleared = VariantClear(target);
    if (FAILED(cleared))
        return cleared;
    VARIANT copy = *source;
    const HRESULT owned = OwnContents(copy);
    if (SUCCEEDED(owned))
        *target = copy;
    return owned;
}

HRESULT WINAPI VariantCopyInd(VARIANT* target, const VARIANTARG* source) {
    if ((source->vt & VT_BYREF) == 0)
        return VariantCopy(target, source);
    if (!win32::IsSupportedVariantType(source->vt))
        return DISP_E_BADVARTYPE;
    if (!source->byref)
        return E_INVALIDARG;
    VARIANT value;
    HRESULT result = Dereference(*source, value);
    if (SUCCEEDED(result))
        result = OwnContents(value);
    if (FAILED(result))
        return result;
    // The target is cleared last: it may be what the source refers to.
    result = VariantClear(target);
    if (FAILED(result)) {
        VariantClear(&value);
        return result;
    }
    *target = value;
    return S_OK;
}
