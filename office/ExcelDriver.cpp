#include "office/ExcelDriver.h"

#include "office/AutomationScope.h"
#include "office/InstalledApplications.h"
#include "office/OfficeApplication.h"
#include "office/OutputWait.h"
#include "office/PrintJob.h"
#include "office/RunAutomation.h"
#include "office/StandardArguments.h"
#include "office/dispatch/ExcelObjects.h"

namespace {

using namespace std::chrono_literals;

constexpr OutputWait Wait{100ms, false, 4s};

/// Prints the whole workbook once into the file. The printer is named in the call, and nothing of
/// Excel's own is changed.
void PrintIntoFile(excel::Workbook& workbook, const wxString& path, const wxString& printer,
                   StandardArguments& arg) {
    COleVariant copies(static_cast<SHORT>(1));
    COleVariant activePrinter(printer.wc_str());
    COleVariant prToFileName(path.wc_str());
    workbook.PrintOut(arg.ArgOmitted, // From
                      arg.ArgOmitted, // To
                      copies,         // Copies
                      arg.ArgFalse,   // Preview
                      activePrinter,  // ActivePrinter
                      arg.ArgTrue,    // PrintToFile
                      arg.ArgFalse,   // Collate
                      prToFileName);  // PrToFileName
}

/// From the running application to the printed file and Excel told to quit.
bool PrintThroughExcel(excel::Application& application, const wxString& inputPath,
                       const PSOutput& output, const wxString& printer, StandardArguments& arg,
                       const ProgressReporter& report) {
    excel::Workbooks workbooks = application.GetWorkbooks();
    report(20);
    excel::Workbook workbook =
        workbooks.OpenReadOnly(inputPath.wc_str(), arg.ArgTrue, arg.ArgOmitted);
    report(30);
    PrintIntoFile(workbook, output.path, printer, arg);
    if (!WaitForOutput(output.path, Wait))
        return false;
    report(85);

    workbook.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
    report(90);
    workbook.ReleaseDispatch();
    workbooks.ReleaseDispatch();
    application.Quit();
    report(95);
    return true;
}

} // namespace

ResultCode PrintExcelWorkbook(const wxString& inputPath, const wxString& outputFolder,
                              wxString& psFileName, ProgressSink* progress,
                              const wxString* printer) {
    const AutomationScope scope;
    if (inputPath.empty())
        return Result::InputFileNotFound;

    const wxFileName workbook(inputPath);
    const PSOutput output(workbook, outputFolder);
    const ProgressReporter report(progress, workbook.GetName());
    psFileName = output.fileName;
    const AFX_MAINTAIN_STATE2 moduleState(AfxGetStaticModuleState());
    const bool isInstalled = IsApplicationInstalledForExtension(workbook.GetExt());
    report(5);
    if (!isInstalled)
        return Result::ExcelNotInstalled;

    const wxString chosenPrinter = ChoosePrinter(*printer);
    if (chosenPrinter.empty())
        return Result::DistillerNotInstalled;
    report(10);

    excel::Application application;
    StandardArguments arg;
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Excel)))
        return Result::ExcelStartFailed;
    report(15);
    const bool isPrinted = RunAutomation([&] {
        return PrintThroughExcel(application, inputPath, output, chosenPrinter, arg, report);
    });
    if (!isPrinted) {
        QuitAfterFailure(application);
        return Result::PrintFailed;
    }

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
