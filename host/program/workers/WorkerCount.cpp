#include "host/program/workers/WorkerCount.h"

#include "host/program/documents/InputCheck.h"
#include "host/program/system/ConversionTurn.h"

#include <wx/utils.h>

#include <algorithm>
#include <thread>

namespace {

// Of a document of a few pages, in seconds: its work, and what its driver waits in any case.
constexpr double Work = 0.4;
constexpr double Wait = 0.1;
constexpr double WaitForPowerPoint = 2.3; // which is busy for a while with what it has closed

constexpr std::size_t MostForEachProcessor = 4;
constexpr double MemoryOfAWorker = 400 << 20; // bytes, its engine's included

bool IsPresentation(const Input& input) {
    const wxString extension = ExtensionOf(input);
    return extension.StartsWith("pp"); // ppt, pptx, pps, ppsx
}

/// What the documents take, over their work alone.
double TimeForWork(const std::vector<Input>& inputs) {
    const auto presentations =
        static_cast<double>(std::count_if(inputs.begin(), inputs.end(), IsPresentation));
    const auto others = static_cast<double>(inputs.size()) - presentations;
    return 1 + (presentations * WaitForPowerPoint + others * Wait) /
                   (static_cast<double>(inputs.size()) * Work);
}

std::size_t WorkersWithMemory() {
    const wxMemorySize free = wxGetFreeMemory(); // negative when it is not known
    return free < 0 ? SIZE_MAX : static_cast<std::size_t>(free.ToDouble() / MemoryOfAWorker);
}

} // namespace

std::size_t WorthwhileWorkers(const std::vector<Input>& inputs) {
    if (inputs.size() < 2 || ConversionTurn::AreTaken())
        return 1;
    const std::size_t processors = std::max(1U, std::thread::hardware_concurrency());
    const auto workers =
        static_cast<std::size_t>(static_cast<double>(processors) * TimeForWork(inputs));
    return std::clamp(std::min({workers, MostForEachProcessor * processors, WorkersWithMemory()}),
                      std::size_t{1}, inputs.size());
}

unsigned WorthwhileEngineDocuments(std::size_t documents, std::size_t workers) {
    constexpr unsigned ManyDocuments = 500; // what an engine may collect is gone then
    constexpr std::size_t DocumentsThatStartingOnceTakes = 3;
    return documents >= DocumentsThatStartingOnceTakes * workers ? ManyDocuments : 1;
}
