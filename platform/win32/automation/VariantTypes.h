#pragma once

#include <oleauto.h>

namespace win32 {

/// Whether a value of this type can stand in a VARIANT here; one passed by reference may be a
/// VARIANT as well. Arrays and the types that this system has no use for are refused.
bool IsSupportedVariantType(VARTYPE type);

} // namespace win32
