#include "office/WordDriver.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"

#include <benchmark/benchmark.h>

namespace {

/// The driver waits this long between its two readings of the file's size, whatever happens.
constexpr double FixedWaitSeconds = 0.1;

/// One conversion with a Word that answers at once: what remains besides the fixed wait is the
/// filter's own.
void ConvertWithInstantWord(benchmark::State& state) {
    const TemporaryFolder folder;
    RecordingOffice office({L"Word.Application"});
    office.On("Document", 444, [&](const std::vector<std::wstring>& texts) {
        folder.Write(std::filesystem::path(texts.at(0)).filename(), "%!PS-Adobe-3.0\nshowpage\n");
    });
    const wxString printer = "Any";
    wxString psName;
    for (auto step : state) {
        (void)step;
        const auto start = std::chrono::steady_clock::now();
        const ResultCode result = PrintWordDocument("/in/letter.docx", folder.Path().wstring(),
                                                    psName, nullptr, &printer);
        const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
        if (result != Result::Success)
            state.SkipWithError("the conversion failed");
        state.SetIterationTime(taken.count() - FixedWaitSeconds);
    }
}
BENCHMARK(ConvertWithInstantWord)->UseManualTime()->Iterations(20)->Unit(benchmark::kMillisecond);

} // namespace
