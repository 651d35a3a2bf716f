#pragma once

#include "platform/win32/base/HandleTable.h"
#include "platform/win32/spooler/Printer.h"

#include <mutex>

namespace win32 {

/// What a printer's HANDLE stands for: a printer, and what may be done with it.
struct OpenedPrinter {
    std::shared_ptr<Printer> printer;
    DWORD access;
};

/// The printers that this process sees, and the drivers and printers that it put in by hand.
class Spooler {
public:
    static Spooler& Instance();

    /// The printers put in by hand in the order they came, then those of CUPS.
    Printers All();
    /// @return null when there is no such printer
    std::shared_ptr<Printer> Find(const std::wstring& name);

    /// These four answer a system error code.
    DWORD AddDriver(PrinterDriver driver);
    DWORD RemoveDriver(const std::wstring& name);
    /// @param driverName one that was added
    DWORD AddPrinter(const std::shared_ptr<Printer>& printer, const std::wstring& driverName);
    DWORD RemovePrinter(const std::shared_ptr<Printer>& printer);

    HandleTable<OpenedPrinter>& Handles() { return m_handles; }

private:
    std::mutex m_mutex;
    std::vector<std::shared_ptr<const PrinterDriver>> m_drivers;
    Printers m_printers;
    HandleTable<OpenedPrinter> m_handles;
};

} // namespace win32
