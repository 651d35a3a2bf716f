#include "office/CompoundFileCheck.h"
#include "plugin/interface/ResultCodes.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"

#include <benchmark/benchmark.h>
#include <gsf/gsf-infile-msole.h>
#include <gsf/gsf-input-stdio.h>

namespace {

std::filesystem::path WriteDocument(const TemporaryFolder& folder) {
    CompoundFile file;
    file.AddStream(u"WordDocument", std::string(200'000, 'd'));
    file.AddStream(u"1Table", std::string(50'000, 't'));
    file.AddStream(u"\u0005SummaryInformation", std::string(400, 's'));
    return folder.Write("document.doc", file.Bytes());
}

void CheckDocument(benchmark::State& state) {
    const TemporaryFolder folder;
    const wxString path(WriteDocument(folder).wstring());
    for (auto step : state) {
        (void)step;
        if (CheckWordCompoundFile(path) != Result::Success)
            state.SkipWithError("the check failed");
    }
}
BENCHMARK(CheckDocument);

void OpenWithLibraryAlone(benchmark::State& state) {
    const TemporaryFolder folder;
    const std::string path = WriteDocument(folder).string();
    for (auto step : state) {
        (void)step;
        GsfInput* input = gsf_input_stdio_new(path.c_str(), nullptr);
        GsfInfile* storage = gsf_infile_msole_new(input, nullptr);
        if (!storage)
            state.SkipWithError("the library cannot open the file");
        g_object_unref(storage);
        g_object_unref(input);
    }
}
BENCHMARK(OpenWithLibraryAlone);

} // namespace
