#pragma once

#include <windows.h>
#include <winspool.h>

#include <atomic>
#include <memory>
#include <string>
#include <vector>

namespace win32 {

/// The only environment that drivers are installed for.
extern const std::wstring DriverEnvironment;

struct PrinterDriver {
    std::wstring name;
    std::wstring driverPath;
    std::wstring dataFile;
    std::wstring configFile;
    std::wstring helpFile;
    std::wstring monitorName;
    std::wstring defaultDataType;
};

/// One printer: put in by this process, or a queue of CUPS.
struct Printer {
    std::wstring name;
    std::wstring shareName;
    std::wstring portName;
    std::wstring comment;
    std::wstring location;
    std::wstring printProcessor = L"winprint";
    std::wstring dataType = L"RAW";
    DWORD attributes = PRINTER_ATTRIBUTE_LOCAL;
    DWORD priority = 1;
    bool isQueue = false; ///< of CUPS: only its administrator removes it
    std::shared_ptr<const PrinterDriver> driver;
    std::atomic<bool> deleted = false;
};

using Printers = std::vector<std::shared_ptr<Printer>>;

} // namespace win32
