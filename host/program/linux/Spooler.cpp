#include "host/program/system/Spooler.h"

#include "host/program/linux/PrinterAbilities.h"
#include "host/program/linux/PrinterDescription.h"
#include "host/program/linux/SpoolerRequest.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

constexpr int ConnectingTakes = 5000; // milliseconds
constexpr double AnswerTakes = 10;    // seconds

/// Of a job.
constexpr const char* JobAttributes[] = {"job-id",
                                         "job-name",
                                         "job-uuid",
                                         "job-state",
                                         "job-state-reasons",
                                         "job-printer-state-message",
                                         "number-of-documents"};

http_t* Http(const std::shared_ptr<void>& connection) {
    return static_cast<http_t*>(connection.get());
}

ipp_attribute_t* Attribute(ipp_t* answer, const char* name) {
    return ippFindAttribute(answer, name, IPP_TAG_ZERO);
}

SpooledJob::Progress ProgressOf(int state, bool isPrinterStopped) {
    using Progress = SpooledJob::Progress;
    switch (static_cast<ipp_jstate_t>(state)) {
    case IPP_JSTATE_PENDING:
        return isPrinterStopped ? Progress::Stuck : Progress::Waiting;
    case IPP_JSTATE_HELD:
    case IPP_JSTATE_STOPPED:
        return Progress::Stuck;
    case IPP_JSTATE_PROCESSING:
        return Progress::Working;
    case IPP_JSTATE_CANCELED:
        return Progress::Canceled;
    case IPP_JSTATE_ABORTED:
        return Progress::Aborted;
    case IPP_JSTATE_COMPLETED:
        break;
    }
    return Progress::Completed;
}

/// Reads the attributes of one job, and goes on to the next one.
SpooledJob ReadJob(ipp_t* answer, ipp_attribute_t*& at) {
    SpooledJob job;
    int state = IPP_JSTATE_PENDING;
    wxString reasons;
    bool isPrinterStopped = false;
    for (; at && ippGetGroupTag(at) == IPP_TAG_JOB; at = ippNextAttribute(answer)) {
        const std::string name = ippGetName(at) ? ippGetName(at) : "";
        const char* const bytes = ippGetString(at, 0, nullptr);
        const wxString text = wxString::FromUTF8(bytes ? bytes : "");
        if (name == "job-id")
            job.number = ippGetInteger(at, 0);
        else if (name == "job-name")
            job.name = text;
        else if (name == "job-uuid")
            job.uuid = text;
        else if (name == "job-state")
            state = ippGetInteger(at, 0);
        else if (name == "number-of-documents")
            job.documents = ippGetInteger(at, 0);
        else if (name == "job-printer-state-message")
            job.message = text;
        else if (name == "job-state-reasons" && text != "none")
            reasons = text;
        isPrinterStopped = isPrinterStopped || (name == "job-state-reasons" &&
                                                ippContainsString(at, "printer-stopped") != 0);
    }
    if (job.message.empty())
        job.message = reasons;
    job.progress = ProgressOf(state, isPrinterStopped);
    return job;
}

std::vector<SpooledJob> ReadJobs(ipp_t* answer) {
    std::vector<SpooledJob> jobs;
    for (ipp_attribute_t* at = ippFirstAttribute(answer); at;) {
        if (ippGetGroupTag(at) == IPP_TAG_JOB)
            jobs.push_back(ReadJob(answer, at));
        else
            at = ippNextAttribute(answer);
    }
    return jobs;
}

Fault NoQueue(const wxString& queue, const wxString& server) {
    return {wxString::Format(_("the print server %s has no queue \"%s\""), server, queue),
            Blame::Usage, ConversionFailed, _("`lpstat -e` shows which there are")};
}

/// That a queue takes no jobs, which somebody has told it.
std::optional<Fault> FindRefusal(ipp_t* printer, const wxString& queue) {
    ipp_attribute_t* const accepts = Attribute(printer, "printer-is-accepting-jobs");
    if (!accepts || ippGetBoolean(accepts, 0))
        return std::nullopt;
    wxString what = wxString::Format(_("the queue \"%s\" takes no jobs at the moment"), queue);
    const char* const reason =
        ippGetString(Attribute(printer, "printer-state-message"), 0, nullptr);
    if (reason && *reason)
        what << ": " << OneLine(wxString::FromUTF8(reason));
    return Fault{what, Blame::Machine, ConversionFailed,
                 wxString::Format(_("`cupsaccept %s` has it take them again"), queue)};
}

/// The attributes of a queue's printer.
IppMessage AskForPrinter(http_t* server, const wxString& queue, const wxString& address,
                         Fault& fault) {
    if (!server)
        return {nullptr, ippDelete};
    IppMessage printer = Ask(server, RequestAbout(queue, IPP_OP_GET_PRINTER_ATTRIBUTES), fault);
    if (!printer && WasNotFound())
        fault = NoQueue(queue, address);
    return printer;
}

} // namespace

bool Spooler::IsAvailable() {
    return true;
}

std::shared_ptr<void> Spooler::Connection(Fault& fault) {
    if (m_connection)
        return m_connection;
    if (!m_server.empty())
        cupsSetServer(m_server.utf8_str());
    // Nobody is there to be asked for a password.
    cupsSetPasswordCB2([](const char*, http_t*, const char*, const char*,
                          void*) -> const char* { return nullptr; },
                       nullptr);
    http_t* const http = httpConnect2(cupsServer(), ippPort(), nullptr, AF_UNSPEC, cupsEncryption(),
                                      1, ConnectingTakes, nullptr);
    if (!http) {
        fault = {wxString::Format(_("the print server %s cannot be reached"), Address()),
                 Blame::Machine};
        return nullptr;
    }
    httpSetTimeout(
        http, AnswerTakes, [](http_t*, void*) { return 0; }, nullptr);
    m_connection.reset(http, httpClose);
    return m_connection;
}

wxString Spooler::Address() {
    if (!m_server.empty())
        cupsSetServer(m_server.utf8_str());
    const wxString server = wxString::FromUTF8(cupsServer());
    if (server.Contains(":"))
        return wxString::Format("[%s]:%d", server, ippPort());
    return server.StartsWith("/") ? server : wxString::Format("%s:%d", server, ippPort());
}

std::optional<Fault> Spooler::Check(const PrintTicket& ticket) {
    Fault fault;
    const auto connection = Connection(fault);
    const IppMessage printer = AskForPrinter(Http(connection), ticket.queue, Address(), fault);
    if (!printer) {
        LetGo();
        return fault;
    }
    const auto description = PrinterDescription::Fetch(Http(connection), ticket.queue);
    for (const auto& [option, value] : ticket.options)
        if (auto unsupported = FindUnsupported(printer.get(), description ? &*description : nullptr,
                                               ticket.queue, option, value))
            return unsupported;
    return FindRefusal(printer.get(), ticket.queue);
}

std::optional<PrintWay> Spooler::FindWay(const wxString& queue,
                                         const std::vector<std::string>& types,
                                         const PageSize& pages, Fault& fault) {
    const auto connection = Connection(fault);
    const IppMessage printer = AskForPrinter(Http(connection), queue, Address(), fault);
    if (!printer) {
        LetGo();
        return std::nullopt;
    }
    PrintWay way;
    ipp_attribute_t* const supported = Attribute(printer.get(), "document-format-supported");
    for (const std::string& type : types)
        if (supported && ippContainsString(supported, type.c_str()))
            way.types.push_back(type);
    if (way.types.empty()) {
        fault = {
            wxString::Format(_("the queue \"%s\" takes neither PostScript nor PDF files"), queue),
            Blame::Usage, ConversionFailed, _("Choose another queue")};
        return std::nullopt;
    }
    way.media = MediaFor(printer.get(), pages);
    const auto description = PrinterDescription::Fetch(Http(connection), queue);
    const bool isTooLarge = pages.width > 0 && way.media.empty();
    // The server scales PDF only, and nothing where it does not know the printer.
    if (description && (isTooLarge || !description->TakesPostScript()))
        std::stable_partition(way.types.begin(), way.types.end(),
                              [](const std::string& type) { return type == "application/pdf"; });
    return way;
}

std::optional<int> Spooler::Create(const PrintTicket& ticket, const wxString& name, Fault& fault) {
    const auto connection = Connection(fault);
    if (!connection)
        return std::nullopt;
    IppMessage request = RequestAbout(ticket.queue, IPP_OP_CREATE_JOB);
    ippAddString(request.get(), IPP_TAG_OPERATION, IPP_TAG_NAME, "job-name", nullptr,
                 name.utf8_str());
    cups_option_t* options = nullptr;
    int count = 0;
    for (const auto& [option, value] : ticket.options)
        count = cupsAddOption(option.c_str(), value.c_str(), count, &options);
    cupsEncodeOptions2(request.get(), count, options, IPP_TAG_OPERATION);
    cupsEncodeOptions2(request.get(), count, options, IPP_TAG_JOB);
    cupsFreeOptions(count, options);
    const IppMessage answer = Ask(Http(connection), std::move(request), fault);
    ipp_attribute_t* const number = answer ? Attribute(answer.get(), "job-id") : nullptr;
    if (number)
        return ippGetInteger(number, 0);
    LetGo();
    if (answer)
        fault = {_("the print server's answer cannot be understood"), Blame::Machine};
    else if (WasNotFound())
        fault = NoQueue(ticket.queue, Address());
    return std::nullopt;
}

std::optional<Fault> Spooler::Send(const wxString& queue, int number,
                                   const std::filesystem::path& file, const std::string& type) {
    Fault fault;
    const auto connection = Connection(fault);
    if (!connection)
        return fault;
    IppMessage request = RequestAbout(queue, IPP_OP_SEND_DOCUMENT);
    ippAddInteger(request.get(), IPP_TAG_OPERATION, IPP_TAG_INTEGER, "job-id", number);
    ippAddString(request.get(), IPP_TAG_OPERATION, IPP_TAG_MIMETYPE, "document-format", nullptr,
                 type.c_str());
    ippAddBoolean(request.get(), IPP_TAG_OPERATION, "last-document", 1);
    if (Ask(Http(connection), std::move(request), fault, file.c_str()))
        return std::nullopt;
    LetGo();
    if (WasNotFound()) // the job is, which whoever looks for it will find out
        fault.blame = Blame::Machine;
    return fault;
}

std::optional<std::vector<SpooledJob>> Spooler::Find(int number, Fault& fault) {
    const auto connection = Connection(fault);
    if (!connection)
        return std::nullopt;
    IppMessage request = RequestAbout(number, IPP_OP_GET_JOB_ATTRIBUTES);
    AskFor(request.get(), JobAttributes);
    const IppMessage answer = Ask(Http(connection), std::move(request), fault);
    if (answer)
        return ReadJobs(answer.get());
    if (WasNotFound())
        return std::vector<SpooledJob>();
    LetGo();
    return std::nullopt;
}

std::optional<std::vector<SpooledJob>> Spooler::Unfinished(const wxString& queue, Fault& fault) {
    const auto connection = Connection(fault);
    if (!connection)
        return std::nullopt;
    IppMessage request = RequestAbout(queue, IPP_OP_GET_JOBS);
    ippAddBoolean(request.get(), IPP_TAG_OPERATION, "my-jobs", 1);
    ippAddString(request.get(), IPP_TAG_OPERATION, IPP_TAG_KEYWORD, "which-jobs", nullptr,
                 "not-completed");
    AskFor(request.get(), JobAttributes);
    const IppMessage answer = Ask(Http(connection), std::move(request), fault);
    if (answer)
        return ReadJobs(answer.get());
    LetGo();
    if (WasNotFound())
        fault = NoQueue(queue, Address());
    return std::nullopt;
}

std::optional<Fault> Spooler::Cancel(int number) {
    Fault fault;
    const auto connection = Connection(fault);
    if (!connection)
        return fault;
    if (Ask(Http(connection), RequestAbout(number, IPP_OP_CANCEL_JOB), fault))
        return std::nullopt;
    LetGo();
    return fault;
}
