#pragma once

#include <windows.h>
#include <winspool.h>

#include <vector>

// Records of the spooler, each list in a buffer of just the size that the spooler asks for.

/// @param flags PRINTER_ENUM_ flags
/// @param count receives the number of PRINTER_INFO_2W in the buffer
inline std::vector<BYTE> PrinterRecords(DWORD flags, DWORD& count) {
    DWORD needed = 0;
    EnumPrintersW(flags, nullptr, 2, nullptr, 0, &needed, &count);
    std::vector<BYTE> buffer(needed);
    EnumPrintersW(flags, nullptr, 2, buffer.data(), needed, &needed, &count);
    return buffer;
}

/// @return one DRIVER_INFO_3W
inline std::vector<BYTE> DriverRecord(HANDLE printer) {
    DWORD needed = 0;
    GetPrinterDriverW(printer, nullptr, 3, nullptr, 0, &needed);
    std::vector<BYTE> buffer(needed);
    GetPrinterDriverW(printer, nullptr, 3, buffer.data(), needed, &needed);
    return buffer;
}
