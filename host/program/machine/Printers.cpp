#include "host/program/Printers.h"

#include "host/program/FilePrinter.h"

#include <windows.h>
#include <winspool.h>

#include <algorithm>
#include <cstddef>
#include <functional>

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
