#pragma once

#include "office/dispatch/DispatchWrapper.h"

// Excel's objects. Optional arguments are passed as variants by value, as Excel's type library has
// them.

namespace excel {

class Workbook : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void PrintOut(const VARIANT* from, const VARIANT* to, const VARIANT* copies,
                  const VARIANT* preview, const VARIANT* activePrinter, const VARIANT* printToFile,
                  const VARIANT* collate, const VARIANT* prToFileName);
    void Close(const VARIANT* saveChanges, const VARIANT* fileName, const VARIANT* routeWorkbook);
};

class Workbooks : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    /// Workbooks.Open with the arguments but the file's name and the third all omitted.
    /// @param omitted serves for each of them
    Workbook OpenReadOnly(LPCTSTR fileName, const VARIANT* readOnly, const VARIANT* omitted);
};

class Application : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Workbooks GetWorkbooks();
    void Quit();
};

} // namespace excel
