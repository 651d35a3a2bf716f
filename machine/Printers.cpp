#include "machine/Printers.h"

#include "common/UniqueHandle.h"

#include <windows.h>
#include <winspool.h>

#include <cwchar>
#include <string>

namespace {

constexpr wchar_t DistillerDriver[] = L"AdobePS Acrobat Distiller";

struct PrinterTraits {
    using Type = HANDLE;
    static Type None() { return nullptr; }
    static void Close(Type printer) { ClosePrinter(printer); }
};
using PrinterHandle = UniqueHandle<PrinterTraits>;

/// A record of the spooler's and the texts that it points to; from operator new, and so aligned.
using SpoolerBuffer = std::vector<BYTE>;

wxString TextOf(LPCWSTR text) {
    return text ? wxString(text) : wxString();
}

bool HasPpdExtension(const wchar_t* path) {
    wchar_t extension[_MAX_EXT];
    _wsplitpath(path, nullptr, nullptr, nullptr, extension);
    return wxString(extension).IsSameAs(".ppd", false);
}

} // namespace

bool Printer::IsDistiller() const {
    return driver == DistillerDriver;
}

bool Printer::IsPostScript() const {
    std::wstring writableName = name.ToStdWstring();
    PRINTER_DEFAULTSW access{nullptr, nullptr, PRINTER_READ};
    PrinterHandle printer;
    if (name.empty() || !OpenPrinterW(writableName.data(), printer.Receive(), &access))
        return false;

    DWORD needed = 0;
    GetPrinterDriverW(printer.Get(), nullptr, 3, nullptr, 0, &needed);
    SpoolerBuffer buffer(needed + 1);
    if (needed == 0 ||
        !GetPrinterDriverW(printer.Get(), nullptr, 3, buffer.data(), needed, &needed))
        return false;
    const auto* record = reinterpret_cast<const DRIVER_INFO_3W*>(buffer.data());
    return record->pDataFile && HasPpdExtension(record->pDataFile);
}

std::vector<Printer> ListPrinters() {
    constexpr DWORD Flags = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;
    DWORD needed = 0;
    DWORD count = 0;
    EnumPrintersW(Flags, nullptr, 2, nullptr, 0, &needed, &count);
    SpoolerBuffer buffer(needed + 1);
    if (needed == 0 || !EnumPrintersW(Flags, nullptr, 2, buffer.data(), needed, &needed, &count))
        return {};
    std::vector<Printer> printers;
    const auto* records = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    for (DWORD i = 0; i < count; ++i)
        printers.push_back({TextOf(records[i].pPrinterName), TextOf(records[i].pDriverName)});
    return printers;
}
