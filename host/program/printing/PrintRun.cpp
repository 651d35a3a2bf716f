#include "host/program/printing/PrintRun.h"

#include "host/program/base/PathText.h"
#include "host/program/system/Interruption.h"
#include "host/services/OneLine.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <thread>

using namespace std::chrono_literals;

namespace {

/// How long a server may have no room for a job, and be silent about one.
constexpr std::chrono::seconds RoomTakes = 60s;
constexpr std::chrono::seconds LongestSilence = 300s;

constexpr std::chrono::milliseconds BetweenTries = 500ms;

/// A job's name on the server: the document's, as far as the protocol lets it be.
wxString NameFor(const Outcome& outcome) {
    constexpr std::size_t MostBytes = 255;
    wxString name = OneLine(Shown(outcome.input.filename()));
    while (name.utf8_string().size() > MostBytes)
        name.RemoveLast();
    return name;
}

} // namespace

PrintRun::PrintRun(PrintTicket ticket) : m_ticket(std::move(ticket)), m_spooler(m_ticket.server) {}

std::optional<PrintRun> PrintRun::Open(const PrintTicket& ticket, Fault& fault) {
    PrintRun run(ticket);
    if (std::optional<Fault> lack = run.m_spooler.Check(ticket)) {
        fault = std::move(*lack);
        return std::nullopt;
    }
    const std::optional<bool> wantsPdf = ::WantsPdf(run.m_spooler, ticket.queue, fault);
    if (!wantsPdf)
        return std::nullopt;
    run.m_wantsPdf = *wantsPdf;
    return run;
}

/// Tries again while the server has no room.
PrintReply PrintRun::MakeJob(const Submission& submission) {
    const Clock::time_point end = Clock::now() + RoomTakes;
    for (;;) {
        PrintReply reply = MakePrintJob(m_spooler, submission);
        if (!reply.fault || reply.fault->blame != Blame::Machine || Interruption::Requested() ||
            Clock::now() > end)
            return reply;
        std::this_thread::sleep_for(BetweenTries);
    }
}

/// A server that dies while it answers has the document.
std::optional<Fault> PrintRun::Send(const Submission& submission, const PrintedJob& job) {
    std::optional<Fault> fault = SendToPrinter(m_spooler, submission, job.number, job.uuid);
    if (!fault)
        return std::nullopt;
    const PrintReply found = FindPrintJob(m_spooler, job.number);
    if (found.fault)
        return fault;
    if (!found.job || found.job->uuid != job.uuid)
        return LossOf(job.queue, job.number);
    if (found.job->documents > 0)
        return std::nullopt;
    m_spooler.Cancel(job.number); // it would wait for its document
    return fault;
}

void PrintRun::Submit(Outcome& outcome, const wxString& message) {
    Submission submission;
    submission.ticket = m_ticket;
    submission.name = NameFor(outcome);
    submission.document = outcome.made;
    PrintReply reply = MakeJob(submission);
    if (reply.job) {
        const PrintedJob job = {m_spooler.Address(), m_ticket.queue, reply.job->number,
                                reply.job->uuid};
        reply.fault = Send(submission, job);
        if (!reply.fault) {
            outcome.print = job;
            return;
        }
    }
    Fault fault = reply.fault.value_or(
        Fault{_("the print server's answer cannot be understood"), Blame::Machine});
    fault.code = Result::PrintFailed;
    outcome.End(State::Failed, std::move(fault), message);
}

PrintRun::Look PrintRun::LookAt(const Outcome& outcome) {
    const PrintedJob& job = *outcome.print;
    const PrintReply reply = FindPrintJob(m_spooler, job.number);
    Look look;
    if (reply.fault) {
        const Clock::time_point now = Clock::now();
        look.message = reply.fault->Text();
        if (now - m_silentSince.value_or(now) > LongestSilence)
            look = {true, reply.fault, look.message};
        m_silentSince = m_silentSince.value_or(now);
        return look;
    }
    m_silentSince.reset();
    if (!reply.job || reply.job->uuid != job.uuid) {
        look = {true, LossOf(job.queue, job.number), {}};
    } else {
        look.isOver = IsOver(*reply.job);
        look.fault = WhyNotPrinted(*reply.job, job.queue);
        look.message = reply.job->message;
    }
    return look;
}
