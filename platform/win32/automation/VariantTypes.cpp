#include "platform/win32/automation/VariantTypes.h"

#include "platform/win32/base/LogSink.h"

namespace win32 {

bool IsSupportedVariantType(VARTYPE type) {
    switch (type) {
    case VT_EMPTY:
    case VT_I2:
    case VT_I4:
    case VT_BSTR:
    case VT_DISPATCH:
    case VT_ERROR:
    case VT_BOOL:
    case VT_VARIANT | VT_BYREF:
        return true;
    default:
        Log("automation: variants of type " + std::to_string(type) + " are not supported");
        return false;
    }
}

} // namespace win32
