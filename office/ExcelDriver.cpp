#include "office/ExcelDriver.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/InstalledApplications.h"
#include "office/OutputWait.h"
#include "office/PrintJob.h"
#include "office/StandardArguments.h"
#include "office/dispatch/ExcelObjects.h"

#include <optional>

namespace {

using namespace std::chrono_literals;

constexpr OutputWait Wait{100ms, false, 4s};

/// What the driver holds of Excel. Released in the opposite order.
struct ExcelObjects {
    excel::Application application;
    excel::Workbooks workbooks;
    excel::Workbook workbook;
};

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

/// From Excel's start to the printed file and Excel told to quit.
ResultCode PrintThroughExcel(ExcelObjects& objects, const wxString& inputPath,
                             const PSOutput& output, const wxString& printer,
                             StandardArguments& arg, const ProgressReporter& report) {
    auto& [application, workbooks, workbook] = objects;
    if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Excel)))
        return Result::ExcelStartFailed;
    report(15);
    workbooks = application.GetWorkbooks();
    report(20);
    workbook = workbooks.OpenReadOnly(inputPath.wc_str(), arg.ArgTrue, arg.ArgOmitted);
    report(30);
    PrintIntoFile(workbook, output.path, printer, arg);
    if (!WaitForOutput(output.path, Wait))
        return Result::PrintFailed;
    report(85);

    workbook.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
    report(90);
    workbook.ReleaseDispatch();
    workbooks.ReleaseDispatch();
    application.Quit();
    report(95);
    return Result::Success;
}

} // namespace

ResultCode PrintExcelWorkbook(const wxString& inputPath, const wxString& outputFolder,
                              wxString& psFileName, ProgressSink* progress,
                              const wxString* printer) {
    std::optional<AFX_MAINTAIN_STATE2> moduleState; // switched back when the scope has been closed
    const AutomationScope scope;
    if (inputPath.empty())
        return Result::InputFileNotFound;

    const wxFileName workbook(inputPath);
    const PSOutput output(workbook, outputFolder);
    const ProgressReporter report(progress, workbook.GetName());
    psFileName = output.fileName;
    moduleState.emplace(AfxGetStaticModuleState());
    const bool isInstalled = IsApplicationInstalledForExtension(workbook.GetExt());
    report(5);
    if (!isInstalled)
        return Result::ExcelNotInstalled;

    const wxString chosenPrinter = ChoosePrinter(*printer);
    if (chosenPrinter.empty())
        return Result::DistillerNotInstalled;
    report(10);

    // An Excel that fails is told to quit while the workbook is still held, and then released.
    ExcelObjects objects;
    StandardArguments arg;
    const ResultCode printed = CatchAll(Result::PrintFailed, [&] {
        return PrintThroughExcel(objects, inputPath, output, chosenPrinter, arg, report);
    });
    if (printed == Result::PrintFailed)
        CatchAll([&] { objects.application.Quit(); }); // it may be past listening
    if (printed != Result::Success)
        return printed;

    const ResultCode result = RepairOutput(output);
    report(100);
    return result;
}
