#include "pstools/PrinterDiscovery.h"

#include "common/UniqueHandle.h"

#include <windows.h>
#include <winspool.h>

#include <cwchar>
#include <vector>

namespace {

constexpr wchar_t DistillerDriver[] = L"AdobePS Acrobat Distiller";

struct PrinterTraits {
    using Type = HANDLE;
    static Type None() { return nullptr; }
    static void Close(Type printer) { ClosePrinter(printer); }
};
using PrinterHandle = UniqueHandle<PrinterTraits>;

/// The spooler's records of all printers, local ones and connections. The records point into the
/// buffer that the object holds.
class PrinterList {
public:
    PrinterList() {
        constexpr DWORD Flags = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;
        DWORD needed = 0;
        EnumPrintersW(Flags, nullptr, 2, nullptr, 0, &needed, &m_count);
        m_buffer.resize(needed + 1);
        if (needed == 0 ||
            !EnumPrintersW(Flags, nullptr, 2, m_buffer.data(), needed, &needed, &m_count))
            m_count = 0;
    }

    const PRINTER_INFO_2W* begin() const {
        return reinterpret_cast<const PRINTER_INFO_2W*>(m_buffer.data());
    }
    const PRINTER_INFO_2W* end() const { return begin() + m_count; }

private:
    std::vector<BYTE> m_buffer; // from operator new, and so aligned for the records
    DWORD m_count = 0;
};

bool HasPpdExtension(const wchar_t* path) {
    wchar_t extension[_MAX_EXT];
    _wsplitpath(path, nullptr, nullptr, nullptr, extension);
    return wxString(extension).IsSameAs(".ppd", false);
}

bool IsPostScriptPrinter(wchar_t* printerName) {
    PRINTER_DEFAULTSW access{nullptr, nullptr, PRINTER_READ};
    PrinterHandle printer;
    if (!OpenPrinterW(printerName, printer.Receive(), &access))
        return false;

    DWORD needed = 0;
    GetPrinterDriverW(printer.Get(), nullptr, 3, nullptr, 0, &needed);
    std::vector<BYTE> buffer(needed + 1);
    if (needed == 0 ||
        !GetPrinterDriverW(printer.Get(), nullptr, 3, buffer.data(), needed, &needed))
        return false;
    const auto* driver = reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data());
    return driver->pDataFile && HasPpdExtension(driver->pDataFile);
}

} // namespace

bool FindDistillerPrinter(wxString& printerName) {
    for (const PRINTER_INFO_2W& printer : PrinterList()) {
        if (printer.pDriverName && wxString(printer.pDriverName) == DistillerDriver) {
            printerName = printer.pPrinterName;
            return true;
        }
    }
    return false;
}

void ListPostScriptPrinters(wxArrayString& printers) {
    for (const PRINTER_INFO_2W& printer : PrinterList())
        if (printer.pPrinterName && IsPostScriptPrinter(printer.pPrinterName))
            printers.Add(printer.pPrinterName);
}
