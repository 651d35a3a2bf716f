#include "host/program/printing/Submission.h"

#include "host/services/OneLine.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <algorithm>
#include <fstream>
#include <sstream>
#include <string_view>

namespace fs = std::filesystem;

namespace {

struct Kind {
    const char* ending;
    const char* type;
};

/// PostScript goes first: it is what the application has printed.
constexpr Kind Kinds[] = {{".ps", "application/postscript"}, {".pdf", "application/pdf"}};

fs::path FileOf(const Submission& submission, const Kind& kind) {
    fs::path file = submission.document;
    file.replace_extension(kind.ending);
    const fs::path forPrinter = file.parent_path() / ForPrinterFolder / file.filename();
    std::error_code error;
    return fs::is_regular_file(forPrinter, error) ? forPrinter : file;
}

/// Takes away what was left without its document, and counts the others.
std::optional<Fault> MakeRoom(Spooler& spooler, const Submission& submission) {
    Fault fault;
    const auto jobs = spooler.Unfinished(submission.ticket.queue, fault);
    if (!jobs)
        return fault;
    std::size_t others = 0;
    for (const SpooledJob& job : *jobs) {
        if (job.name != submission.name || job.documents > 0)
            ++others;
        else if (auto left = spooler.Cancel(job.number))
            return left;
    }
    if (others < *submission.most)
        return std::nullopt;
    return Fault{wxString::Format(_("the queue \"%s\" has %zu jobs of this user already"),
                                  submission.ticket.queue, others),
                 Blame::Machine};
}

/// @return the best of what has been made; null when the queue takes none of it
const Kind* Choose(const Submission& submission, const PrintWay& way) {
    std::error_code error;
    for (const std::string& type : way.types)
        for (const Kind& kind : Kinds)
            if (type == kind.type && fs::is_regular_file(FileOf(submission, kind), error))
                return &kind;
    return nullptr;
}

Fault NothingFor(const Submission& submission) {
    return {wxString::Format(_("the queue \"%s\" does not take what was made of the document"),
                             submission.ticket.queue),
            Blame::Usage, ConversionFailed,
            _("Have PDF made as well, by the settings, or choose another queue")};
}

/// The size of the pages, by the comments in front of PostScript; 0 where they do not tell.
PageSize SizeOf(const fs::path& postScript) {
    constexpr std::string_view Media = "%%DocumentMedia:";
    constexpr int MostLines = 200;
    std::ifstream file(postScript, std::ios::binary);
    PageSize size;
    std::string line;
    for (int i = 0; i < MostLines && std::getline(file, line); ++i) {
        if (line.rfind(Media, 0) != 0)
            continue;
        std::string name;
        std::istringstream(line.substr(Media.size())) >> name >> size.width >> size.height;
        break;
    }
    return size;
}

std::optional<PrintWay> FindWay(Spooler& spooler, const wxString& queue, const PageSize& pages,
                                Fault& fault) {
    std::vector<std::string> types;
    for (const Kind& kind : Kinds)
        types.emplace_back(kind.type);
    return spooler.FindWay(queue, types, pages, fault);
}

std::optional<PrintWay> FindWay(Spooler& spooler, const Submission& submission, Fault& fault) {
    return FindWay(spooler, submission.ticket.queue, SizeOf(FileOf(submission, Kinds[0])), fault);
}

/// Has pages printed at their size; where the printer has no such paper, or is to take another,
/// those that are too large for it are made smaller.
PrintTicket WithPaper(PrintTicket ticket, const std::string& media) {
    for (const char* const scaling : {"print-scaling", "fit-to-page", "scaling", "natural-scaling"})
        if (ticket.options.count(scaling) > 0)
            return ticket;
    const bool isTheirs = !media.empty() && ticket.options.count("media") == 0 &&
                          ticket.options.count("PageSize") == 0;
    if (isTheirs)
        ticket.options["media"] = media;
    ticket.options["print-scaling"] = isTheirs ? "none" : "auto-fit";
    return ticket;
}

} // namespace

PrintReply MakePrintJob(Spooler& spooler, const Submission& submission) {
    if (std::optional<Fault> fault = spooler.Check(submission.ticket))
        return {fault, {}};
    Fault fault;
    const std::optional<PrintWay> way = FindWay(spooler, submission, fault);
    if (!way)
        return {fault, {}};
    const Kind* const kind = Choose(submission, *way);
    if (submission.mayWantPdf && (!kind || way->types.front() != kind->type))
        return {{}, {}, true};
    if (!kind)
        return {NothingFor(submission), {}};
    if (submission.most)
        if (std::optional<Fault> lack = MakeRoom(spooler, submission))
            return {lack, {}};
    const std::optional<int> number =
        spooler.Create(WithPaper(submission.ticket, way->media), submission.name, fault);
    if (!number)
        return {fault, {}};
    PrintReply reply = FindPrintJob(spooler, *number);
    if (reply.fault)
        spooler.Cancel(*number); // nobody knows of it
    return reply;
}

std::optional<Fault> SendToPrinter(Spooler& spooler, const Submission& submission, int number,
                                   const wxString& uuid) {
    if (std::optional<Fault> loss = FindLoss(spooler, submission.ticket.queue, number, uuid))
        return loss;
    Fault fault;
    const std::optional<PrintWay> way = FindWay(spooler, submission, fault);
    if (!way)
        return fault;
    const Kind* const kind = Choose(submission, *way);
    if (!kind)
        return NothingFor(submission);
    return spooler.Send(submission.ticket.queue, number, FileOf(submission, *kind), kind->type);
}

PrintReply FindPrintJob(Spooler& spooler, int number) {
    Fault fault;
    auto jobs = spooler.Find(number, fault);
    if (!jobs)
        return {fault, {}};
    return {{}, jobs->empty() ? std::nullopt : std::optional(std::move(jobs->front()))};
}

std::optional<Fault> FindLoss(Spooler& spooler, const wxString& queue, int number,
                              const wxString& uuid) {
    PrintReply reply = FindPrintJob(spooler, number);
    if (reply.fault || (reply.job && reply.job->uuid == uuid))
        return std::move(reply.fault);
    return LossOf(queue, number);
}

std::optional<bool> WantsPdf(Spooler& spooler, const wxString& queue, Fault& fault) {
    const std::optional<PrintWay> way = FindWay(spooler, queue, {}, fault);
    return way ? std::optional(way->types.front() != Kinds[0].type) : std::nullopt;
}

wxString JobText(const wxString& queue, int number) {
    return wxString::Format(_("job %d of %s"), number, OneLine(queue));
}

bool IsOver(const SpooledJob& job) {
    using Progress = SpooledJob::Progress;
    return job.progress == Progress::Completed || job.progress == Progress::Aborted ||
           job.progress == Progress::Canceled;
}

std::optional<Fault> WhyNotPrinted(const SpooledJob& job, const wxString& queue) {
    if (!IsOver(job) || job.progress == SpooledJob::Progress::Completed)
        return std::nullopt;
    wxString what = wxString::Format(job.progress == SpooledJob::Progress::Canceled
                                         ? _("%s was cancelled")
                                         : _("the print server has given up %s"),
                                     JobText(queue, job.number));
    if (!job.message.empty())
        what << ": " << job.message;
    return Fault{what, Blame::Document, Result::PrintFailed};
}

Fault LossOf(const wxString& queue, int number) {
    return {wxString::Format(_("the print server has lost %s; whether it was printed is not known"),
                             JobText(queue, number)),
            Blame::Machine, Result::PrintFailed};
}
