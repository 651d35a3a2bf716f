#include "office/PublisherDriver.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/InstalledApplications.h"
#include "office/OutputWait.h"
#include "office/PrintJob.h"
#include "office/dispatch/PublisherObjects.h"
#include "pstools/DistillerDevModeGuard.h"

namespace {

using namespace std::chrono_literals;

// Publisher has written the file when its print call returns: a file that is not there by then
// does not come, and the repair reports it.
constexpr OutputWait Wait{100ms, true, 0s};

constexpr LONG DoNotSaveChanges = 3; // pbDoNotSaveChanges
constexpr LONG WholePublication = -1;

/// What the driver holds of Publisher. Released in the opposite order.
struct PublisherObjects {
    publisher::Application application;
    publisher::Document publication;
};

/// From Publisher's start to the printed file and Publisher told to quit.
ResultCode PrintThroughPublisher(PublisherObjects& objects, const wxString& inputPath,
                                 const PSOutput& output, const wxString& printer,
                                 const ProgressReporter& report) {
    auto& [application, publication] = objects;
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Publisher)))
        return Result::PublisherStartFailed;
    report(20);
    publication = application.Open(inputPath.wc_str(), TRUE, FALSE, DoNotSaveChanges);
    report(30);
    publication.PutActivePrinter(printer.wc_str());
    report(35);
    publication.PrintOut(WholePublication, WholePublication, output.path.wc_str(), 1, FALSE);
    if (!WaitForOutput(output.path, Wait))
        return Result::PrintFailed;
    report(85);

    publication.Close();
    report(90);
    publication.ReleaseDispatch();
    application.Quit();
    report(95);
    return Result::Success;
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
    // printer are the filter's own. Publisher is released before they are the user's again; one
    // that fails is told to quit while the publication is still held.
    const DistillerDevModeGuard guard;
    PublisherObjects objects;
    const ResultCode printed = CatchAll(Result::PrintFailed, [&] {
        return PrintThroughPublisher(objects, inputPath, output, chosenPrinter, report);
    });
    if (printed == Result::PrintFailed)
        CatchAll([&] { objects.application.Quit(); }); // it may be past listening
    if (printed != Result::Success)
        return printed;

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
