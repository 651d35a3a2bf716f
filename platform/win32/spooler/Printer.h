#pragma once

#include <windows.h>
#include <winspool.h>

#include <atomic>
#include <memory>
#include <string>
#include <vector>

namespace win32 {

struct PrinterDriver {
    std::wstring name;
    std::wstring dataFile;
};

/// One printer: put in by this process, or a queue of CUPS.
struct Printer {
    std::wstring name;
    std::wstring portName;
    DWORD attributes = PRINTER_ATTRIBUTE_LOCAL;
    bool isQueue = false; ///< of CUPS: only its administrator removes it
    std::shared_ptr<const PrinterDriver> driver;
    std::atomic<bool> deleted = false;
};

using Printers = std::vector<std::shared_ptr<Printer>>;

} // namespace win32
