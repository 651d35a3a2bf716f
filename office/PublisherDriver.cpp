#include "office/PublisherDriver.h"

#include "office/AutomationScope.h"
#include "office/InstalledApplications.h"
#include "office/OfficeApplication.h"
#include "office/OutputWait.h"
#include "office/PrintJob.h"
#include "office/RunAutomation.h"
#include "office/dispatch/PublisherObjects.h"
#include "pstools/DistillerDevModeGuard.h"

namespace {

using namespace std::chrono_literals;

// Publisher has written the file when its print call returns: a file that is not there by then
// does not come, and the repair reports it.
constexpr OutputWait Wait{100ms, true, 0s};

constexpr LONG DoNotSaveChanges = 3; // pbDoNotSaveChanges
constexpr LONG WholePublication = -1;

/// From the running application to the printed file and Publisher told to quit.
bool PrintThroughPublisher(publisher::Application& application, const wxString& inputPath,
                           const PSOutput& output, const wxString& printer,
                           const ProgressReporter& report) {
    publisher::Document publication =
        application.Open(inputPath.wc_str(), TRUE, FALSE, DoNotSaveChanges);
    report(30);
    publication.PutActivePrinter(printer.wc_str());
    report(35);
    publication.PrintOut(WholePublication, WholePublication, output.path.wc_str(), 1, FALSE);
    if (!WaitForOutput(output.path, Wait))
        return false;
    report(85);

    publication.Close();
    report(90);
    publication.ReleaseDispatch();
    application.Quit();
    report(95);
    return true;
}

} // namespace

ResultCode PrintPublisherDocument(const wxString& inputPath, const wxString& outputFolder,
                                  wxString& psFileName, ProgressSink* progress,
                                  const wxString* printer) {
    const AutomationScope scope;
    if (inputPath.empty())
        return Result::InputFileNotFound;

    const wxFileName publication(inputPath);
    const PSOutput output(publication, outputFolder);
    const ProgressReporter report(progress, publication.GetName());
    psFileName = output.fileName;
    const bool isInstalled = IsApplicationInstalledForExtension(publication.GetExt());
    report(5);
    if (!isInstalled)
        return Result::PublisherNotInstalled;

    const wxString chosenPrinter = ChoosePrinter(*printer);
    report(10);
    if (chosenPrinter.empty())
        return Result::DistillerNotInstalled;

    const int installLevel = GetPublisherInstallLevel();
    report(15);
    if (installLevel == 0)
        return Result::PublisherNotInstalled;
    if (installLevel == 1)
        return Result::PublisherTooOld;

    // From the application's start to the repaired file the user's defaults for the Distiller
    // printer are the filter's own. Publisher is released before they are the user's again.
    const DistillerDevModeGuard guard;
    publisher::Application application;
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Publisher)))
        return Result::PublisherStartFailed;
    report(20);
    const bool isPrinted = RunAutomation([&] {
        return PrintThroughPublisher(application, inputPath, output, chosenPrinter, report);
    });
    if (!isPrinted) {
        QuitAfterFailure(application);
        return Result::PrintFailed;
    }

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
