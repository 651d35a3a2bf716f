#include "host/program/machine/FilePrinter.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"

#include <windows.h>
#include <winspool.h>

#include <algorithm>
#include <functional>
#include <string>

namespace {

/// The spooler's records take texts that can be written to, but only read them.
LPWSTR Writable(const wchar_t* text) {
    return const_cast<LPWSTR>(text);
}

bool PutInDriver(std::wstring dataFile) {
    DRIVER_INFO_3W driver = {};
    driver.cVersion = 3;
    driver.pName = Writable(FilePrinterName);
    driver.pDriverPath = Writable(L"pscript5.dll");
    driver.pDataFile = dataFile.data();
    driver.pConfigFile = Writable(L"ps5ui.dll");
    driver.pDefaultDataType = Writable(L"RAW");
    return AddPrinterDriverW(nullptr, 3, reinterpret_cast<LPBYTE>(&driver)) ||
           GetLastError() == ERROR_PRINTER_DRIVER_ALREADY_INSTALLED;
}

bool PutInPrinter() {
    PRINTER_INFO_2W record = {};
    record.pPrinterName = Writable(FilePrinterName);
    record.pDriverName = Writable(FilePrinterName);
    record.pPortName = Writable(L"FILE:");
    record.pPrintProcessor = Writable(L"winprint");
    record.pDatatype = Writable(L"RAW");
    record.pComment = Writable(L"Prints into PostScript files");
    record.Attributes = PRINTER_ATTRIBUTE_LOCAL;
    HANDLE printer = AddPrinterW(nullptr, 2, reinterpret_cast<LPBYTE>(&record));
    if (!printer)
        return GetLastError() == ERROR_PRINTER_ALREADY_EXISTS;
    ClosePrinter(printer);
    return true;
}

} // namespace

const Printer* PreferredPrinter(const std::vector<Printer>& printers) {
    const std::function<bool(const Printer&)> preferences[] = {
        [](const Printer& printer) { return printer.IsDistiller(); },
        [](const Printer& printer) {
            return printer.name == FilePrinterName && printer.IsPostScript();
        },
        [](const Printer& printer) { return printer.IsPostScript(); },
    };
    for (const auto& preferred : preferences) {
        const auto found = std::find_if(printers.begin(), printers.end(), preferred);
        if (found != printers.end())
            return &*found;
    }
    return nullptr;
}

void AddFilePrinter(const std::filesystem::path& ppd) {
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(ppd, ignored)) {
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The description of the file printer is missing: " << Shown(ppd);
        return;
    }
    if (!PutInDriver(ToText(ppd).ToStdWstring()) || !PutInPrinter())
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The file printer could not be added, error "
            << wxString::Format("%u", GetLastError());
}
