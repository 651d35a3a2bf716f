#include "platform/win32/automation/VariantTypes.h"

#include "platform/win32/log/LogSink.h"

namespace win32 {

bool IsSupportedVariantType(VARTYPE type) {
    switch (type & ~VT_BYREF) {
    case VT_EMPTY:
    case VT_NULL:
        return (type & VT_BYREF) == 0;
    case VT_I2:
    case VT_I4:
    case VT_R8:
    case VT_BSTR:
    case VT_DISPATCH:
    case VT_ERROR:
    case VT_BOOL:
    case VT_UNKNOWN:
        return true;
    case VT_VARIANT:
        return (type & VT_BYREF) != 0;
    default:
        Log("automation: variants of type " + std::to_string(type) + " are not supported");
        return false;
    }
}

} // namespace win32
