#pragma once

#include "host/program/system/Spooler.h"

// The steps by which a document comes to a print server. Between any two of them this program may
// be ended, or the server, so that each is told before the next one is done.

/// What came of a step.
struct PrintReply {
    std::optional<Fault> fault; ///< then nothing is known of the job
    std::optional<SpooledJob> job;
    bool wantsPdf = false; ///< no job has been made, since PDF is what the queue prints as it is
};

/// The folder beside a document's output where what is made for the printer alone lies.
constexpr const char* ForPrinterFolder = "printer";

/// How a document is submitted.
struct Submission {
    PrintTicket ticket;
    wxString name; ///< the job's, which no other document has
    /// Jobs of this user's in the queue, beyond which none is made. Not given, none is looked for
    /// that an earlier program may have left either.
    std::optional<std::size_t> most;
    bool mayWantPdf = false; ///< PDF can be made of the document, if only PostScript was
    /// PostScript or PDF; the other kind may lie beside it, or in ForPrinterFolder.
    std::filesystem::path document;
};

/// Makes the job, without its document. One that was made before, by a program that was ended
/// before it could write down the number, is taken away.
PrintReply MakePrintJob(Spooler& spooler, const Submission& submission);

/// Gives the job its document, unless the server has lost it meanwhile: its number may be that of
/// another one. To be asked for once: a print server takes a second document, too.
std::optional<Fault> SendToPrinter(Spooler& spooler, const Submission& submission, int number,
                                   const wxString& uuid);

/// Looks for a job.
/// @return without a job when the server has none of that number
PrintReply FindPrintJob(Spooler& spooler, int number);

/// Why a job is not to be touched: the server has none of that number any more, or another one, or
/// cannot say.
std::optional<Fault> FindLoss(Spooler& spooler, const wxString& queue, int number,
                              const wxString& uuid);

/// Whether PDF is what a queue prints as it is, and not what applications print.
/// @return nothing when it cannot be asked, or takes neither
std::optional<bool> WantsPdf(Spooler& spooler, const wxString& queue, Fault& fault);

/// What people know a job by.
wxString JobText(const wxString& queue, int number);

/// Whether nothing comes of a job any more.
bool IsOver(const SpooledJob& job);

/// Why a job that is over has not come out.
std::optional<Fault> WhyNotPrinted(const SpooledJob& job, const wxString& queue);

/// That a server knows nothing of a job that it has had.
Fault LossOf(const wxString& queue, int number);
