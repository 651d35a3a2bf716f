#include "office/OpenXmlCheck.h"

#include "common/CatchAll.h"
#include "machine/OfficeApplication.h"
#include "office/AutomationScope.h"
#include "office/StandardArguments.h"
#include "office/dispatch/ExcelObjects.h"
#include "office/dispatch/PowerPointObjects.h"
#include "office/dispatch/WordObjects.h"
#include "plugin/interface/ResultCodes.h"

namespace {

int CheckBy(bool (*tryOpen)(wxString), const wxString& path) {
    if (path.empty())
        return Result::InputFileNotFound;
    return tryOpen(path) ? Result::Success : Result::InvalidInputFile;
}

} // namespace

// Where an application refuses the document it is not told to quit: releasing it is all that can
// be asked of one that may be in any state.

bool TryOpenInWord(wxString path) { // NOLINT(performance-unnecessary-value-param)
    return CatchAll(false, [&] {
        const AutomationScope scope;
        StandardArguments arg;
        word::Application application;
        if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Word)))
            return false;
        word::Documents documents = application.GetDocuments();
        word::Document document =
            documents.Add(arg.ArgOmitted, arg.ArgOmitted, arg.ArgOmitted, arg.ArgOmitted);
        COleVariant fileName(path.wc_str());
        document = documents.OpenReadOnly(fileName, arg.ArgTrue, arg.ArgOmitted);
        document.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
        application.Quit(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
        return true;
    });
}

bool TryOpenInExcel(wxString path) { // NOLINT(performance-unnecessary-value-param)
    return CatchAll(false, [&] {
        const AutomationScope scope;
        StandardArguments arg;
        excel::Application application;
        if (!application.CreateDispatch(ProgIdOf(OfficeApplication::Excel)))
            return false;
        excel::Workbooks workbooks = application.GetWorkbooks();
        excel::Workbook workbook =
            workbooks.OpenReadOnly(path.wc_str(), arg.ArgTrue, arg.ArgOmitted);
        workbook.Close(arg.ArgFalse, arg.ArgOmitted, arg.ArgOmitted);
        application.Quit();
        return true;
    });
}

bool TryOpenInPowerPoint(wxString path) { // NOLINT(performance-unnecessary-value-param)
    return CatchAll(false, [&] {
        const AutomationScope scope;
        powerpoint::Application application;
        if (!application.CreateDispatch(ProgIdOf(OfficeApplication::PowerPoint)))
            return false;
        powerpoint::Presentations presentations = application.GetPresentations();
        powerpoint::Presentation presentation = presentations.Open(path.wc_str(), 1, 1, 0);
        presentation.Close();
        application.Quit();
        return true;
    });
}

int CheckWordOpenXmlFile(const wxString& path) {
    return CheckBy(TryOpenInWord, path);
}

int CheckExcelOpenXmlFile(const wxString& path) {
    return CheckBy(TryOpenInExcel, path);
}

int CheckPowerPointOpenXmlFile(const wxString& path) {
    return CheckBy(TryOpenInPowerPoint, path);
}
