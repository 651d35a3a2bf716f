#include "host/program/documents/Conversion.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/FilterCall.h"
#include "host/program/documents/Screening.h"
#include "host/program/documents/Workplace.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/system/ConversionTurn.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <chrono>

namespace fs = std::filesystem;

namespace {

/// Why the filter failed, as far as the host can see.
Fault Explain(const FilterAnswer& answer, const wxString& document,
              const OutputFolder& outputFolder) {
    const int code = answer.code;
    const std::optional<Fault> pdfMaker =
        code == Result::PdfConversionFailed ? FindMissingPdfMaker() : std::nullopt;
    if (IsMachineCode(code))
        return {MachineReason(wxFileName(document).GetExt()), Blame::Machine, code};
    if (pdfMaker)
        return *pdfMaker;
    if (answer.failure)
        return {answer.failure->what, answer.failure->blame, code};
    if (outputFolder.IsFull())
        return {_("there is no space left for the output or for temporary files"), Blame::Machine,
                code};
    if (code == Result::PrintFailed)
        return {_("its application could not open or print it: it may be damaged or protected, or "
                  "need more time than --engine-limit gives"),
                Blame::Document, code};
    return {{}, Blame::Document, code};
}

/// Moves the output, and what else the filter has made of the document, to the output folder.
/// @return why the output is not there for certain
std::optional<Fault> DeliverAll(const Workplace& workplace, const wxString& outputName,
                                const wxString& baseName) {
    const wxString ownBase = wxFileName(outputName).GetName();
    std::error_code error;
    for (const auto& entry : fs::directory_iterator(workplace.Path(), error)) {
        const wxString name = ToText(entry.path().filename());
        wxString ending;
        if (name != outputName && name.StartsWith(ownBase + '.', &ending))
            workplace.Deliver(name, baseName + '.' + ending); // no harm where it is not there
    }
    const std::optional<Fault> fault =
        workplace.Deliver(outputName, baseName + '.' + wxFileName(outputName).GetExt());
    return fault ? fault : workplace.ConfirmDelivery();
}

/// Runs the filter in a workplace of its own and takes over what it made.
/// @return why there is no output
std::optional<Fault> Convert(const ScreenedInput& screened, const wxString& baseName,
                             const OutputFolder& outputFolder, ProgressSink& progress,
                             Outcome& outcome) {
    Fault fault;
    const std::optional<Workplace> workplace = Workplace::Create(outputFolder.Path(), fault);
    if (!workplace)
        return fault;
    wxString outputName;
    const FilterAnswer answer = CallFilter(Shown(outcome.input.filename()), [&] {
        const ConversionTurn turn;
        return screened.filter->Convert(*screened.item, ToText(workplace->Path()), outputName,
                                        progress);
    });
    outcome.fonts = LastFontStandIns();
    if (answer.code != Result::Success)
        return Explain(answer, screened.item->fileName, outputFolder);
    std::error_code error;
    if (!fs::is_regular_file(workplace->Path() / FromText(outputName), error))
        return Fault{_("the filter reported success"), Blame::Document, Result::OutputFileNotFound};
    if (std::optional<Fault> lost = DeliverAll(*workplace, outputName, baseName))
        return lost;
    outcome.state = State::Converted;
    outcome.output =
        outputFolder.Path() / FromText(baseName + '.' + wxFileName(outputName).GetExt());
    return std::nullopt;
}

} // namespace

Outcome ConvertInput(const Input& input, const wxString& baseName, const FilterSet& filters,
                     const OutputFolder& outputFolder, ProgressSink& progress) {
    const auto start = std::chrono::steady_clock::now();
    const ScreenedInput screened = Screen(filters, input);
    Outcome outcome = screened.outcome;
    if (screened.item)
        if (const auto fault = Convert(screened, baseName, outputFolder, progress, outcome))
            outcome.End(State::Failed, *fault, screened.filter->ErrorText(fault->code));
    outcome.seconds =
        std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    return outcome;
}
