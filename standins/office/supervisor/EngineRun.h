#pragma once

#include "standins/office/shared/HostOrder.h"
#include "standins/office/supervisor/OfficeHost.h"
#include "standins/shared/Channel.h"
#include "standins/shared/Failure.h"
#include "standins/supervisor/EngineProcess.h"
#include "standins/supervisor/EngineWatch.h"

#include <cstdint>
#include <functional>

namespace standins {

/// A document's work, said in both ways.
struct EngineWork {
    const EngineCommand& command; ///< for a LibreOffice that is started for it
    const HostOrder& order;       ///< for one that is kept started
};

/// Has LibreOffice do the work, and waits until all that it has started has ended.
/// @param host of a LibreOffice that is kept started, to be used as long as there is nothing wrong
/// with it; null for none
/// @param bytesWritten as for EngineWatch::Await
/// @param server is told when there was something wrong with the host
Failure RunLibreOffice(const EngineWork& work, OfficeHost* host, EngineWatch& watch,
                       const std::function<std::uint64_t()>& bytesWritten, const Channel& server);

} // namespace standins
