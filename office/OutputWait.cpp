#include "office/OutputWait.h"

#include "machine/FiltersFolder.h"
#include "machine/OutputClocks.h"
#include "pstools/FileProbe.h"

#include <windows.h>

#include <wx/msw/registry.h>
#include <wx/utils.h>

namespace {

void TakeFromHost(const char* valueName, std::chrono::milliseconds& limit) {
    const wxRegKey key(wxRegKey::HKCU, HostKey);
    long seconds = 0;
    if (key.Exists() && key.HasValue(valueName) && key.QueryValue(valueName, &seconds) &&
        seconds > 0)
        limit = std::chrono::seconds(seconds);
}

OutputWaitLimits LimitsOfThisWait() {
    OutputWaitLimits limits = GetOutputWaitLimits();
    TakeFromHost(OutputStallSecondsValue, limits.withoutGrowth);
    TakeFromHost(OutputTotalSecondsValue, limits.altogether);
    return limits;
}

} // namespace

OutputWaitLimits& GetOutputWaitLimits() {
    static OutputWaitLimits limits;
    return limits;
}

bool WaitForOutput(const wxString& path, const OutputWait& wait) {
    using Clock = std::chrono::steady_clock;
    const OutputWaitLimits limits = LimitsOfThisWait();
    const Clock::time_point start = Clock::now();
    Clock::time_point lastGrowth = start;

    std::uint64_t size = 0;
    QueryFileSize(path, size);
    for (;;) {
        Sleep(static_cast<DWORD>(wait.pollInterval.count()));
        std::uint64_t newSize = wait.emptyIsStable ? 0 : size; // where the reading fails
        QueryFileSize(path, newSize);
        if (newSize == size && (size != 0 || wait.emptyIsStable))
            break;

        const Clock::time_point now = Clock::now();
        if (newSize != size)
            lastGrowth = now;
        if (now - lastGrowth >= limits.withoutGrowth || now - start >= limits.altogether)
            return false;
        size = newSize;
    }
    if (size >= LargeOutputSize && wait.settleTimeOfLargeFile.count() > 0)
        wxSleep(static_cast<int>(wait.settleTimeOfLargeFile.count()));
    return true;
}
