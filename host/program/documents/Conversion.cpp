#include "host/program/documents/Conversion.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/FilterCall.h"
#include "host/program/documents/OutputFolder.h"
#include "host/program/documents/Screening.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/system/ConversionTurn.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <chrono>

namespace fs = std::filesystem;

namespace {

/// Why the filter failed, as far as the host can see.
Fault Explain(const FilterAnswer& answer, const wxString& document, const fs::path& workplace) {
    const int code = answer.code;
    const std::optional<Fault> pdfMaker =
        code == Result::PdfConversionFailed ? FindMissingPdfMaker() : std::nullopt;
    if (IsMachineCode(code))
        return {MachineReason(wxFileName(document).GetExt()), Blame::Machine, code};
    if (pdfMaker)
        return *pdfMaker;
    if (answer.failure)
        return {answer.failure->what, answer.failure->blame, code};
    if (IsFull(workplace))
        return {_("there is no space left for the output or for temporary files"), Blame::Machine,
                code};
    if (code == Result::PrintFailed)
        return {_("its application could not open or print it: it may be damaged or protected, or "
                  "need more time than --engine-limit gives"),
                Blame::Document, code};
    return {{}, Blame::Document, code};
}

/// Runs the filter in the workplace.
/// @return why there is no output
std::optional<Fault> Convert(const ScreenedInput& screened, const fs::path& workplace,
                             ProgressSink& progress, Outcome& outcome) {
    wxString outputName;
    const FilterAnswer answer = CallFilter(Shown(outcome.input.filename()), [&] {
        const ConversionTurn turn;
        return screened.filter->Convert(*screened.item, ToText(workplace), outputName, progress);
    });
    outcome.fonts = LastFontStandIns();
    if (answer.code != Result::Success)
        return Explain(answer, screened.item->fileName, workplace);
    const fs::path output = workplace / FromText(outputName);
    std::error_code error;
    if (!fs::is_regular_file(output, error))
        return Fault{_("the filter reported success"), Blame::Document, Result::OutputFileNotFound};
    outcome.state = State::Converted;
    outcome.made = output;
    return std::nullopt;
}

} // namespace

Outcome ConvertInput(const Input& input, const FilterSet& filters, const fs::path& workplace,
                     ProgressSink& progress) {
    const auto start = std::chrono::steady_clock::now();
    const ScreenedInput screened = Screen(filters, input);
    Outcome outcome = screened.outcome;
    if (screened.item)
        if (const auto fault = Convert(screened, workplace, progress, outcome))
            outcome.End(State::Failed, *fault, screened.filter->ErrorText(fault->code));
    outcome.seconds =
        std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    return outcome;
}
