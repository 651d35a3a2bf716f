#pragma once

#include "platform/win32/spooler/Printer.h"

#include <chrono>
#include <mutex>

namespace win32 {

/// The queues of the print server that the user's CUPS settings name.
class CupsQueues {
public:
    static CupsQueues& Instance();

    /// The queues, in the server's order; none when the server does not answer within a second.
    /// An answer serves for a few seconds: callers ask for the size first, then for the records,
    /// then for printer by printer, and must not wait each time.
    Printers List();

private:
    std::mutex m_mutex;
    Printers m_queues;
    std::chrono::steady_clock::time_point m_staleAt;
};

} // namespace win32
