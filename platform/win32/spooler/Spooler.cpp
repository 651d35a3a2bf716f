#include "platform/win32/spooler/Spooler.h"

#include "platform/win32/base/LogSink.h"
#include "platform/win32/spooler/CupsQueues.h"
#include "platform/win32/text/CaseFold.h"

#include <algorithm>

namespace win32 {

namespace {

/// Finds a printer or driver by its name; end() when there is none.
template <typename Items>
auto FindNamed(const Items& items, const std::wstring& name) {
    return std::find_if(items.begin(), items.end(),
                        [&](const auto& item) { return SameName(item->name, name); });
}

} // namespace

Spooler& Spooler::Instance() {
    static Spooler spooler;
    return spooler;
}

Printers Spooler::All() {
    Printers queues = CupsQueues::Instance().List();
    const std::lock_guard lock(m_mutex);
    Printers all = m_printers;
    for (auto& queue : queues)
        if (FindNamed(m_printers, queue->name) == m_printers.end())
            all.push_back(std::move(queue));
    return all;
}

std::shared_ptr<Printer> Spooler::Find(const std::wstring& name) {
    {
        const std::lock_guard lock(m_mutex);
        const auto found = FindNamed(m_printers, name);
        if (found != m_printers.end())
            return *found;
    }
    const Printers queues = CupsQueues::Instance().List();
    const auto found = FindNamed(queues, name);
    return found == queues.end() ? nullptr : *found;
}

DWORD Spooler::AddDriver(PrinterDriver driver) {
    const std::lock_guard lock(m_mutex);
    if (FindNamed(m_drivers, driver.name) != m_drivers.end())
        return ERROR_PRINTER_DRIVER_ALREADY_INSTALLED;
    m_drivers.push_back(std::make_shared<const PrinterDriver>(std::move(driver)));
    return ERROR_SUCCESS;
}

DWORD Spooler::RemoveDriver(const std::wstring& name) {
    const std::lock_guard lock(m_mutex);
    const auto found = FindNamed(m_drivers, name);
    if (found == m_drivers.end())
        return ERROR_UNKNOWN_PRINTER_DRIVER;
    const bool inUse = std::any_of(m_printers.begin(), m_printers.end(),
                                   [&](const auto& printer) { return printer->driver == *found; });
    if (inUse)
        return ERROR_PRINTER_DRIVER_IN_USE;
    m_drivers.erase(found);
    return ERROR_SUCCESS;
}

DWORD Spooler::AddPrinter(const std::shared_ptr<Printer>& printer, const std::wstring& driverName) {
    const bool exists = Find(printer->name) != nullptr;
    const std::lock_guard lock(m_mutex);
    const auto driver = FindNamed(m_drivers, driverName);
    if (driver == m_drivers.end())
        return ERROR_UNKNOWN_PRINTER_DRIVER;
    if (exists || FindNamed(m_printers, printer->name) != m_printers.end())
        return ERROR_PRINTER_ALREADY_EXISTS;
    printer->driver = *driver;
    m_printers.push_back(printer);
    return ERROR_SUCCESS;
}

DWORD Spooler::RemovePrinter(const std::shared_ptr<Printer>& printer) {
    if (printer->isQueue) {
        Log("DeletePrinter: a queue of CUPS is not removed from here");
        return ERROR_ACCESS_DENIED;
    }
    const std::lock_guard lock(m_mutex);
    const auto found = std::find(m_printers.begin(), m_printers.end(), printer);
    if (found == m_printers.end())
        return ERROR_PRINTER_DELETED;
    m_printers.erase(found);
    printer->deleted = true;
    return ERROR_SUCCESS;
}

} // namespace win32
