#include "standins/office/inprocess/Printers.h"

#include "standins/office/inprocess/Call.h"

#include <windows.h>
#include <winspool.h>

#include <vector>

namespace standins {

void RequirePrinter(const std::wstring& name) {
    std::wstring changeable = name; // the spooler's interface wants it so
    HANDLE printer = nullptr;
    if (name.empty())
        throw Raised{L"There is no printer to print on."};
    if (!OpenPrinterW(changeable.data(), &printer, nullptr))
        throw Raised{L"There is no printer named " + name + L"."};
    ClosePrinter(printer);
}

std::wstring DefaultPrinter() {
    constexpr DWORD All = PRINTER_ENUM_LOCAL | PRINTER_ENUM_CONNECTIONS;
    DWORD size = 0;
    DWORD count = 0;
    EnumPrintersW(All, nullptr, 2, nullptr, 0, &size, &count);
    std::vector<BYTE> buffer(size);
    if (size == 0 || !EnumPrintersW(All, nullptr, 2, buffer.data(), size, &size, &count))
        return {};
    const auto* printers = reinterpret_cast<const PRINTER_INFO_2W*>(buffer.data());
    for (DWORD i = 0; i < count; ++i) {
        if ((printers[i].Attributes & PRINTER_ATTRIBUTE_DEFAULT) != 0)
            return printers[i].pPrinterName;
    }
    return count > 0 ? printers[0].pPrinterName : std::wstring();
}

} // namespace standins
