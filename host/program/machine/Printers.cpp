#include "host/program/machine/Printers.h"

#include "common/WQServices.h"
#include "host/program/PathText.h"

#include <windows.h>
#include <winspool.h>

#include <algorithm>
#include <cstddef>
#include <functional>
#include <string>

namespace {

const wxString DistillerDriver = "AdobePS Acrobat Distiller";

/// The spooler's records lie in one buffer with the texts that they point to.
using SpoolerBuffer = std::vector<std::max_align_t>;

SpoolerBuffer BufferOf(DWORD bytes) {
    return SpoolerBuffer(bytes / sizeof(std::max_align_t) + 1);
}

LPBYTE BytesOf(SpoolerBuffer& buffer) {
    return reinterpret_cast<LPBYTE>(buffer.data());
}

wxString DriverDataFile(HANDLE printer) {
    DWORD needed = 0;
    GetPrinterDriverW(printer, nullptr, 3, nullptr, 0, &needed);
    SpoolerBuffer buffer = BufferOf(needed);
    if (needed == 0 || !GetPrinterDriverW(printer, nullptr, 3, BytesOf(buffer), needed, &needed))
        return {};
    const auto* driver = reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data());
    return driver->pDataFile ? wxString(driver->pDataFile) : wxString();
}

bool IsDescribedByPpd(LPWSTR printerName) {
    HANDLE printer = nullptr;
    PRINTER_DEFAULTSW defaults = {nullptr, nullptr, PRINTER_READ};
    if (!OpenPrinterW(printerName, &printer, &defaults))
        return false;
    const wxString dataFile = DriverDataFile(printer);
    ClosePrinter(printer);
    return dataFile.Lower().EndsWith(".ppd");
}

wxString TextOf(LPCWSTR text) {
    return text ? wxString(text) : wxString();
}

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

std::vector<Printer> ListPrinters() {
    constexpr DWORD Flags = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;
    DWORD needed = 0;
    DWORD count = 0;
    EnumPrintersW(Flags, nullptr, 2, nullptr, 0, &needed, &count);
    SpoolerBuffer buffer = BufferOf(needed);
    if (needed == 0 || !EnumPrintersW(Flags, nullptr, 2, BytesOf(buffer), needed, &needed, &count))
        return {};
    std::vector<Printer> printers;
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    for (DWORD i = 0; i < count; ++i) {
        Printer printer;
        printer.name = TextOf(records[i].pPrinterName);
        printer.driver = TextOf(records[i].pDriverName);
        printer.isDistiller = printer.driver == DistillerDriver;
        printer.isPostScript = IsDescribedByPpd(records[i].pPrinterName);
        printers.push_back(printer);
    }
    return printers;
}

const Printer* PreferredPrinter(const std::vector<Printer>& printers) {
    const std::function<bool(const Printer&)> preferences[] = {
        [](const Printer& printer) { return printer.isDistiller; },
        [](const Printer& printer) { return printer.name == FilePrinterName; },
        [](const Printer& printer) { return printer.isPostScript; },
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
    if (!PutInDriver(ToText(ppd).value_or(wxString()).ToStdWstring()) || !PutInPrinter())
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The file printer could not be added, error "
            << wxString::Format("%u", GetLastError());
}
