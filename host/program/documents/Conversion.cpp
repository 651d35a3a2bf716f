#include "host/program/documents/Conversion.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/FilterCall.h"
#include "host/program/documents/Screening.h"
#include "host/program/documents/Workplace.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/system/ConversionTurn.h"
#include "plugin/ResultCodes.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <chrono>

namespace fs = std::filesystem;

namespace {

void Fail(int code, const wxString& reason, const Filter& filter, Outcome& outcome,
          bool machineAtFault = false) {
    outcome.state = State::Failed;
    outcome.code = code;
    outcome.text = filter.ErrorText(code);
    outcome.reason = reason;
    outcome.machineAtFault = machineAtFault || IsMachineCode(code);
}

/// What the host can see of why the filter failed.
/// @param failure what its engine has told
void Explain(const JobItem& item, const OutputFolder& outputFolder,
             const std::optional<EngineFailure>& failure, Outcome& outcome) {
    const std::optional<MissingPart> pdfMaker =
        outcome.code == Result::PdfConversionFailed ? FindMissingPdfMaker() : std::nullopt;
    if (outcome.machineAtFault) {
        outcome.reason = MachineReason(wxFileName(item.fileName).GetExt());
    } else if (pdfMaker) {
        outcome.reason = pdfMaker->Text();
        outcome.machineAtFault = true;
    } else if (failure) {
        outcome.reason = failure->reason;
        outcome.machineAtFault = failure->fault != EngineFailure::Fault::Document;
    } else if (outputFolder.IsFull()) {
        outcome.reason = _("there is no space left for the output or for temporary files");
        outcome.machineAtFault = true;
    } else if (outcome.code == Result::PrintFailed) {
        outcome.reason = _("its application could not open or print it: it may be damaged or "
                           "protected, or need more time than --engine-limit gives");
    }
}

/// Moves the output, and what else the filter has made of the document, to the output folder.
/// @return whether the output is there for certain
bool DeliverAll(const Workplace& workplace, const wxString& outputName, const wxString& baseName,
                wxString& fault) {
    const wxString ownBase = wxFileName(outputName).GetName();
    std::error_code error;
    for (const auto& entry : fs::directory_iterator(workplace.Path(), error)) {
        const wxString name = ToText(entry.path().filename()).value_or(wxString());
        wxString ending;
        wxString ignored;
        if (name != outputName && name.StartsWith(ownBase + '.', &ending))
            workplace.Deliver(name, baseName + '.' + ending, ignored);
    }
    return workplace.Deliver(outputName, baseName + '.' + wxFileName(outputName).GetExt(), fault) &&
           workplace.ConfirmDelivery(fault);
}

/// Runs the filter in the workplace and takes over what it made.
/// @param failure receives what its engine has told, when it has failed
void RunFilter(const ScreenedInput& screened, const Workplace& workplace, const wxString& baseName,
               ProgressSink& progress, Outcome& outcome, std::optional<EngineFailure>& failure) {
    wxString outputName;
    FilterAnswer answer = CallFilter(Shown(outcome.input.filename()), [&] {
        const ConversionTurn turn;
        return screened.filter->Convert(
            *screened.item, ToText(workplace.Path()).value_or(wxString()), outputName, progress);
    });
    failure = std::move(answer.failure);
    outcome.fonts = LastFontStandIns();
    if (answer.code != Result::Success)
        return Fail(answer.code, {}, *screened.filter, outcome);
    std::error_code error;
    if (!fs::is_regular_file(workplace.Path() / FromText(outputName), error))
        return Fail(Result::OutputFileNotFound, _("the filter reported success"), *screened.filter,
                    outcome);
    wxString fault;
    if (!DeliverAll(workplace, outputName, baseName, fault))
        return Fail(ConversionFailed, fault, *screened.filter, outcome, true);
    outcome.state = State::Converted;
    outcome.output =
        workplace.Path().parent_path() / FromText(baseName + '.' + wxFileName(outputName).GetExt());
}

Outcome Convert(const ScreenedInput& screened, const wxString& baseName,
                const OutputFolder& outputFolder, ProgressSink& progress) {
    Outcome outcome = screened.outcome;
    wxString fault;
    std::optional<EngineFailure> failure;
    const std::optional<Workplace> workplace = Workplace::Create(outputFolder.Path(), fault);
    if (workplace)
        RunFilter(screened, *workplace, baseName, progress, outcome, failure);
    else
        Fail(ConversionFailed, fault, *screened.filter, outcome, true);
    if (outcome.state == State::Failed && outcome.reason.empty())
        Explain(*screened.item, outputFolder, failure, outcome);
    return outcome;
}

} // namespace

Outcome ConvertInput(const Input& input, const wxString& baseName, const FilterSet& filters,
                     const OutputFolder& outputFolder, ProgressSink& progress) {
    const auto start = std::chrono::steady_clock::now();
    const ScreenedInput screened = Screen(filters, input);
    Outcome outcome =
        screened.item ? Convert(screened, baseName, outputFolder, progress) : screened.outcome;
    outcome.seconds =
        std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    return outcome;
}
