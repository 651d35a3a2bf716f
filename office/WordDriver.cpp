#include "office/WordDriver.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/InstalledApplications.h"
#include "office/OutputWait.h"
#include "office/PrintJob.h"
#include "office/StandardArguments.h"
#include "office/dispatch/WordObjects.h"
#include "pstools/DistillerDevModeGuard.h"

namespace {

using namespace std::chrono_literals;

constexpr OutputWait Wait{100ms, false, 4s};

/// What the driver holds of Word. Released in the opposite order.
struct WordObjects {
    word::Application application;
    word::Documents documents;
    word::Document document;
    word::Dialogs dialogs;
    word::PrintSetupDialog setup;
};

/// Makes the printer Word's own without making it the system's default for every other program.
void SelectPrinter(word::PrintSetupDialog& setup, const wxString& printer) {
    setup.PutDoNotSetAsSysDefault(TRUE);
    setup.PutPrinter(printer.wc_str());
    setup.Execute();
}

/// Prints the whole document once, in the foreground, into the file.
void PrintIntoFile(word::Document& document, const wxString& path, StandardArguments& arg) {
    COleVariant outputFileName(path.wc_str());
    COleVariant copies(static_cast<SHORT>(1));
    document.PrintOut(arg.ArgFalse,   // Background
                      arg.ArgFalse,   // Append
                      arg.ArgOmitted, // Range
                      outputFileName, // OutputFileName
                      arg.ArgOmitted, // From
                      arg.ArgOmitted, // To
                      arg.ArgOmitted, // Item
                      copies,         // Copies
                      arg.ArgOmitted, // Pages
                      arg.ArgOmitted, // PageType
                      arg.ArgTrue,    // PrintToFile
                      arg.ArgFalse,   // Collate
                      arg.ArgOmitted, // ActivePrinterMacGX
                      arg.ArgFalse,   // ManualDuplexPrint
                      arg.ArgFalse,   // PrintZoomColumn
                      arg.ArgFalse,   // PrintZoomRow
                      arg.ArgFalse,   // PrintZoomPaperWidth
                      arg.ArgFalse);  // PrintZoomPaperHeight
}

/// From Word's start to the printed file and Word told to quit.
ResultCode PrintThroughWord(WordObjects& objects, const wxString& inputPath, const PSOutput& output,
                            const wxString& printer, StandardArguments& arg,
                            const ProgressReporter& report) {
    auto& [application, documents, document, dialogs, setup] = objects;
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Word)))
        return Result::WordStartFailed;
    report(15);
    documents = application.GetDocuments();
    report(20);
    document = documents.Add(arg.ArgOmitted, arg.ArgOmitted, arg.ArgOmitted, arg.ArgOmitted);
    report(25);
    COleVariant fileName(inputPath.wc_str());
    COleVariant readOnly(static_cast<SHORT>(1));
    document = documents.OpenReadOnly(fileName, readOnly, arg.ArgOmitted);
    report(30);

    dialogs = application.GetDialogs();
    report(35);
    setup = dialogs.GetPrintSetup();
    report(40);
    SelectPrinter(setup, printer);
    report(55);
    application.PutActivePrinter(printer.wc_str());
    PrintIntoFile(document, output.path, arg);
    if (!WaitForOutput(output.path, Wait))
        return Result::PrintFailed;
    report(85);

    document.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
    report(90);
    setup.ReleaseDispatch();
    dialogs.ReleaseDispatch();
    document.ReleaseDispatch();
    documents.ReleaseDispatch();
    application.Quit(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
    report(95);
    return Result::Success;
}

} // namespace

ResultCode PrintWordDocument(const wxString& inputPath, const wxString& outputFolder,
                             wxString& psFileName, ProgressSink* progress,
                             const wxString* printer) {
    const AutomationScope scope;
    if (inputPath.empty())
        return Result::InputFileNotFound;

    const wxFileName document(inputPath);
    const PSOutput output(document, outputFolder);
    const ProgressReporter report(progress, inputPath);
    psFileName = output.fileName;
    const bool isInstalled = IsApplicationInstalledForExtension(document.GetExt());
    report(5);
    if (!isInstalled)
        return Result::WordNotInstalled;

    const wxString chosenPrinter = ChoosePrinter(*printer);
    if (chosenPrinter.empty())
        return Result::DistillerNotInstalled;
    report(10);

    // From the application's start to the repaired file the user's defaults for the Distiller
    // printer are the filter's own. Word is released before COM goes, and after the guard. It is
    // not told to quit when it fails: it may be in any state, and is only released.
    WordObjects objects;
    StandardArguments arg;
    const DistillerDevModeGuard guard;
    const ResultCode printed = CatchAll(Result::PrintFailed, [&] {
        return PrintThroughWord(objects, inputPath, output, chosenPrinter, arg, report);
    });
    if (printed != Result::Success)
        return printed;

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
