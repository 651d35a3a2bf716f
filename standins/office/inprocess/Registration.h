#pragma once

#include <objbase.h>

namespace standins {

/// Enters the applications that LibreOffice on this machine can serve, and the engine's facts; what
/// was entered before and cannot be served any more goes.
HRESULT RegisterApplications();

/// Takes everything back. Entries of others under the same names stay.
HRESULT UnregisterApplications();

} // namespace standins
