#include "office/dispatch/ExcelObjects.h"

namespace excel {

namespace {

constexpr char ThreeVariants[] = VTS_VARIANT VTS_VARIANT VTS_VARIANT;
constexpr char EightVariants[] =
    VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT;
constexpr char TextAndTwelveVariants[] = VTS_BSTR VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT
    VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT VTS_VARIANT;

} // namespace

void Workbook::PrintOut(const VARIANT* from, const VARIANT* to, const VARIANT* copies,
                        const VARIANT* preview, const VARIANT* activePrinter,
                        const VARIANT* printToFile, const VARIANT* collate,
                        const VARIANT* prToFileName) {
    Call(1772, EightVariants, from, to, copies, preview, activePrinter, printToFile, collate,
         prToFileName);
}

void Workbook::Close(const VARIANT* saveChanges, const VARIANT* fileName,
                     const VARIANT* routeWorkbook) {
    Call(277, ThreeVariants, saveChanges, fileName, routeWorkbook);
}

Workbook Workbooks::OpenReadOnly(LPCTSTR fileName, const VARIANT* readOnly,
                                 const VARIANT* omitted) {
    const VARIANT* updateLinks = omitted;
    return CallForObject<Workbook>(682, TextAndTwelveVariants, fileName, updateLinks, readOnly,
                                   omitted, omitted, omitted, omitted, omitted, omitted, omitted,
                                   omitted, omitted, omitted);
}

Workbooks Application::GetWorkbooks() {
    return GetObjectProperty<Workbooks>(572);
}

void Application::Quit() {
    Call(302, VTS_NONE);
}

} // namespace excel
