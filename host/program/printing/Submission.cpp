#include "host/program/printing/Submission.h"

#include <wx/intl.h>

#include <algorithm>

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
    return file.replace_extension(kind.ending);
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
    if (others < submission.most)
        return std::nullopt;
    return Fault{wxString::Format(_("the queue \"%s\" has %zu jobs of this user already"),
                                  submission.ticket.queue, others),
                 Blame::Machine};
}

} // namespace

PrintReply MakePrintJob(Spooler& spooler, const Submission& submission) {
    if (std::optional<Fault> fault = spooler.Check(submission.ticket))
        return {fault, {}};
    if (std::optional<Fault> fault = MakeRoom(spooler, submission))
        return {fault, {}};
    Fault fault;
    const std::optional<int> number = spooler.Create(submission.ticket, submission.name, fault);
    return number ? FindPrintJob(spooler, *number) : PrintReply{fault, {}};
}

PrintReply SendToPrinter(Spooler& spooler, const Submission& submission, int number) {
    std::vector<std::string> types;
    std::error_code error;
    for (const Kind& kind : Kinds)
        if (fs::is_regular_file(FileOf(submission, kind), error))
            types.emplace_back(kind.type);
    Fault fault;
    const auto type = spooler.Choose(submission.ticket.queue, types, fault);
    if (!type)
        return {fault, {}};
    const auto* const kind = std::find_if(std::begin(Kinds), std::end(Kinds),
                                          [&type](const Kind& each) { return *type == each.type; });
    return {spooler.Send(submission.ticket.queue, number, FileOf(submission, *kind), *type), {}};
}

PrintReply FindPrintJob(Spooler& spooler, int number) {
    Fault fault;
    auto jobs = spooler.Find(number, fault);
    if (!jobs)
        return {fault, {}};
    return {{}, jobs->empty() ? std::nullopt : std::optional(std::move(jobs->front()))};
}
