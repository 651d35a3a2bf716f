#include "office/PowerPointDriver.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/HighQualityDefault.h"
#include "office/InstalledApplications.h"
#include "office/OutputWait.h"
#include "office/PowerPointPrintOptions.h"
#include "office/PrintJob.h"
#include "office/dispatch/PowerPointObjects.h"

namespace {

using namespace std::chrono_literals;

constexpr OutputWait Wait{300ms, false, 5s};
constexpr DWORD MillisecondsBeforeRelease = 2000;

constexpr LONG WholePresentation = -1;

/// From PowerPoint's start to the printed file and the presentation closed.
ResultCode PrintThroughPowerPoint(powerpoint::Application& application, const wxString& inputPath,
                                  const PSOutput& output, const wxString& printer,
                                  const PowerPointOptions& options,
                                  const ProgressReporter& report) {
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::PowerPoint)))
        return Result::PowerPointStartFailed;
    report(15);
    powerpoint::Presentations presentations = application.GetPresentations();
    report(20);
    powerpoint::Presentation presentation = presentations.Open(inputPath.wc_str(), 1, 1, 0);
    report(30);
    powerpoint::PrintOptions printOptions = presentation.GetPrintOptions();
    printOptions.PutActivePrinter(printer.wc_str());
    PutColour(printOptions, options);
    printOptions.PutPrintInBackground(0);
    report(40);
    PutContents(printOptions, options);
    PutSwitches(printOptions, options);
    presentation.PrintOut(WholePresentation, WholePresentation, output.path.wc_str(), 1, 1);
    if (!WaitForOutput(output.path, Wait))
        return Result::PrintFailed;
    report(85);

    presentation.Close();
    report(90);
    printOptions.ReleaseDispatch();
    presentation.ReleaseDispatch();
    presentations.ReleaseDispatch();
    return Result::Success;
}

} // namespace

ResultCode PrintPowerPointPresentation(const wxString& inputPath, const wxString& outputFolder,
                                       wxString& psFileName, ProgressSink* progress,
                                       const wxString* printer, const PowerPointOptions* options) {
    const AutomationScope scope;
    if (inputPath.empty())
        return Result::InputFileNotFound;

    const wxFileName presentation(inputPath);
    const PSOutput output(presentation, outputFolder);
    const ProgressReporter report(progress, presentation.GetName());
    psFileName = output.fileName;
    const bool isInstalled = IsApplicationInstalledForExtension(presentation.GetExt());
    report(5);
    if (!isInstalled)
        return Result::PowerPointNotInstalled;

    const wxString chosenPrinter = ChoosePrinter(*printer);
    report(10);
    if (chosenPrinter.empty())
        return Result::DistillerNotInstalled;

    HighQualityDefault highQuality;
    highQuality.Install(options->highQuality);
    // PowerPoint is one process for all its users, and never told to quit: the user may be working
    // in it. Where it fails, the high-quality default stays with it as it was installed.
    powerpoint::Application application;
    const ResultCode printed = CatchAll(Result::PrintFailed, [&] {
        return PrintThroughPowerPoint(application, inputPath, output, chosenPrinter, *options,
                                      report);
    });
    if (printed != Result::Success)
        return printed;
    highQuality.Restore();
    Sleep(MillisecondsBeforeRelease); // PowerPoint is still busy with the presentation it closed
    application.ReleaseDispatch();

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
