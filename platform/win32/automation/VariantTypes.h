#pragma once

#include <oleauto.h>

namespace win32 {

/// Whether a VARIANT here can be of this type: a value's, or that of a reference to a VARIANT.
/// Arrays and the types that this system has no use for are refused.
bool IsSupportedVariantType(VARTYPE type);

} // namespace win32
