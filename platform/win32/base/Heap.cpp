#include "platform/win32/base/LogSink.h"

#include <windows.h>

#include <sys/mman.h>

#include <cstdlib>

namespace {

/// The one heap there is has nothing to keep; its handle only tells it from null.
char g_processHeap;

// A block that large is filled once and let go of: taking its memory page by page would cost more
// than what is done with it.
constexpr std::size_t LargeBlock = std::size_t{16} << 20;
constexpr std::size_t LargePage = std::size_t{2} << 20;

void* AllocateLarge(std::size_t bytes) {
    void* block = nullptr;
    if (bytes > SIZE_MAX - LargePage || posix_memalign(&block, LargePage, bytes) != 0)
        return nullptr;
    madvise(block, bytes, MADV_HUGEPAGE); // a wish: without it the block is as good, but slower
    return block;
}

} // namespace

HANDLE WINAPI GetProcessHeap() {
    return &g_processHeap;
}

LPVOID WINAPI HeapAlloc(HANDLE heap, DWORD flags, SIZE_T bytes) {
    if (heap != &g_processHeap || flags != 0) {
        win32::Log("HeapAlloc: another heap, or flags that are not supported");
        return nullptr;
    }
    return bytes < LargeBlock ? std::malloc(bytes > 0 ? bytes : 1) : AllocateLarge(bytes);
}

BOOL WINAPI HeapFree(HANDLE heap, DWORD flags, LPVOID block) {
    if (heap != &g_processHeap || flags != 0) {
        SetLastError(ERROR_INVALID_PARAMETER);
        return FALSE;
    }
    std::free(block);
    return TRUE;
}
