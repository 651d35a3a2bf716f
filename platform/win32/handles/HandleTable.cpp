#include "platform/win32/handles/HandleTable.h"

#include <atomic>

namespace win32 {

ULONG_PTR NextHandleValue() {
    static std::atomic<ULONG_PTR> next{ULONG_PTR{1} << 32}; // above the registry's root keys
    return next.fetch_add(4);
}

} // namespace win32
