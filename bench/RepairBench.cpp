#include "pstools/PSRepair.h"
#include "tests/support/TemporaryFolder.h"

#include <benchmark/benchmark.h>

#include <fstream>

namespace {

constexpr std::int64_t FileSize = 1LL << 30;

/// A printed file of 1 GiB with printer language in front of its header.
std::filesystem::path WriteLargeFile(const TemporaryFolder& folder) {
    auto path = folder.Write("large.ps", "\x1b%-12345X@PJL\r\n%!PS-Adobe-3.0\n");
    std::ofstream file(path, std::ios::binary | std::ios::app);
    const std::string block(1 << 20, 'x');
    while (file.tellp() < FileSize)
        file << block;
    return path;
}

void PutFrontBack(const std::filesystem::path& path) {
    std::fstream file(path, std::ios::binary | std::ios::in | std::ios::out);
    file << "\x1b%-12345X@PJL\r\n%!PS-Adobe-3.0\n";
}

// Both begin with a run that does not count: on a virtual machine the first touch of memory is the
// slowest thing there is, and says nothing about either.

void RepairOneGiB(benchmark::State& state) {
    const TemporaryFolder folder;
    const auto path = WriteLargeFile(folder);
    RepairPSHeader(path.wstring());
    PutFrontBack(path);
    for (auto step : state) {
        (void)step;
        if (RepairPSHeader(path.wstring()) != PSRepair::Done)
            state.SkipWithError("the repair failed");
        state.PauseTiming();
        PutFrontBack(path);
        state.ResumeTiming();
    }
    state.SetBytesProcessed(state.iterations() * FileSize);
}
BENCHMARK(RepairOneGiB)->Iterations(5)->Unit(benchmark::kMillisecond)->UseRealTime();

void CopyOneGiB(benchmark::State& state) {
    const TemporaryFolder folder;
    const auto path = WriteLargeFile(folder);
    std::filesystem::copy_file(path, folder / "copy.ps");
    std::filesystem::remove(folder / "copy.ps");
    for (auto step : state) {
        (void)step;
        std::filesystem::copy_file(path, folder / "copy.ps");
        state.PauseTiming();
        std::filesystem::remove(folder / "copy.ps");
        state.ResumeTiming();
    }
    state.SetBytesProcessed(state.iterations() * FileSize);
}
BENCHMARK(CopyOneGiB)->Iterations(5)->Unit(benchmark::kMillisecond)->UseRealTime();

} // namespace
