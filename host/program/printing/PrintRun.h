#pragma once

#include "host/program/documents/Outcome.h"
#include "host/program/printing/Submission.h"

#include <chrono>

/// Has a print server print what a run makes. Its calls wait for the server, which may take
/// seconds.
class PrintRun {
public:
    /// @param fault receives why the queue does not print so
    static std::optional<PrintRun> Open(const PrintTicket& ticket, Fault& fault);

    /// Whether PDF is what the queue prints as it is.
    bool WantsPdf() const { return m_wantsPdf; }

    /// Gives a document's output, which is made, to the server. The outcome says afterwards which
    /// job it is, or that it has failed.
    /// @param message of the code of a print that fails
    void Submit(Outcome& outcome, const wxString& message);

    /// How a job is.
    struct Look {
        bool isOver = false;
        std::optional<Fault> fault; ///< why it has not come out
        wxString message;           ///< what the server says of it
    };
    /// @param outcome with a job
    Look LookAt(const Outcome& outcome);

private:
    using Clock = std::chrono::steady_clock;

    explicit PrintRun(PrintTicket ticket);

    PrintReply MakeJob(const Submission& submission);
    std::optional<Fault> Send(const Submission& submission, const PrintedJob& job);

    PrintTicket m_ticket;
    Spooler m_spooler;
    bool m_wantsPdf = false;
    std::optional<Clock::time_point> m_silentSince; ///< the server
};
