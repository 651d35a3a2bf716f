#include "host/program/watch/JobPrinting.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/watch/JobDecision.h"
#include "host/services/OneLine.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

/// Between two looks at a job: soon at first, then seldom.
constexpr std::chrono::milliseconds FirstLook = 200ms;
constexpr std::chrono::milliseconds LastLook = 5s;

/// Between two tries with a server that has no room, or does not answer.
constexpr std::chrono::milliseconds FirstTry = 1s;
constexpr std::chrono::milliseconds LastTry = 60s;

/// The job's name on the server, which no other document has: with the number that `quillon queue`
/// shows.
wxString NameFor(const Job& job) {
    constexpr std::size_t MostBytes = 255; // by the protocol
    constexpr std::size_t MostOfFolder = 30;
    const wxString document = Shown(job.source.filename());
    wxString name;
    for (std::size_t letters = document.length(); name.empty(); --letters) {
        name << document.Left(letters) << " (" << OneLine(job.folder).Left(MostOfFolder) << ' '
             << job.id << ')';
        if (name.utf8_string().size() > MostBytes)
            name.clear();
    }
    return name;
}

fs::path ProductOf(const Job& job) {
    return job.workplace / FromText(job.product);
}

bool IsProductThere(const Job& job) {
    std::error_code error;
    return fs::exists(ProductOf(job), error) || error;
}

Fault LossOf(const Job& job, bool isHeld) {
    Fault loss = ::LossOf(job.print.queue, job.print.number);
    loss.advice =
        isHeld ? _("It is held in the queue: have it printed with `lp -H resume`, or cancel it")
               : _("It is printed again");
    return loss;
}

void Forget(PrintOrder& order) {
    order.number = 0;
    order.uuid.clear();
    order.message.clear();
}

} // namespace

PrintTicket TicketFor(const Job& job, const FolderConfiguration& folder) {
    PrintTicket ticket = folder.print ? folder.print->ticket : PrintTicket();
    ticket.server = job.print.server;
    ticket.queue = job.print.queue;
    ticket.options.emplace("job-priority", std::to_string(job.priority));
    if (job.print.held)
        ticket.options["job-hold-until"] = "indefinite";
    return ticket;
}

bool JobPrinting::Advance(std::int64_t ticket, Job& job, const FolderConfiguration& folder) {
    if (!IsAtPrinter(job.state) && m_orders.count(ticket) == 0)
        return true;
    Order& order = m_orders[ticket];
    order.folder = job.folder;
    if (order.reply.valid() && order.reply.wait_for(0s) == std::future_status::ready)
        Take(order.reply.get(), order, job, folder);
    if (job.state == JobState::Submitting && !order.reply.valid())
        Reconsider(order, job, folder);
    if (order.isToBeTold)
        Store(job, m_journal);
    order.isToBeTold = false;
    if (!IsAtPrinter(job.state)) {
        m_orders.erase(ticket);
        return true;
    }
    if (!order.reply.valid() && order.next <= Clock::now())
        Begin(order, job, folder);
    return false;
}

/// What was to be submitted may have gone, or is not to be printed any more.
void JobPrinting::Reconsider(Order& order, Job& job, const FolderConfiguration& folder) {
    if (job.print.number > 0 && !order.isEmpty)
        return; // the server may have it
    if (!IsProductThere(job)) {
        Forget(job.print);
        GiveBack(job, {m_journal.Now(), m_journal.Shared() != nullptr});
        order.isToBeTold = true;
    } else if (job.print.number == 0 && !folder.print) {
        job.state = JobState::Delivering;
        order.isToBeTold = true;
    }
}

void JobPrinting::Begin(Order& order, Job& job, const FolderConfiguration& folder) {
    if (job.print.number == 0) {
        job.print.server = Spooler(folder.print->ticket.server).Address();
        job.print.queue = folder.print->ticket.queue;
        order.step = Step::Make;
    } else {
        order.step = std::exchange(order.isEmpty, false) ? Step::Send : Step::Find;
    }
    Submission submission = {TicketFor(job, folder), NameFor(job),
                             folder.print ? folder.print->mostQueued : 0,
                             folder.print && !WantsPdf(folder.print->ticket), ProductOf(job)};
    order.reply = DeskOf(job.print.server)
                      .Ask([step = order.step, number = job.print.number, uuid = job.print.uuid,
                            submission = std::move(submission)](Spooler& spooler) {
                          if (step == Step::Make)
                              return MakePrintJob(spooler, submission);
                          if (step == Step::Find)
                              return FindPrintJob(spooler, number);
                          return PrintReply{SendToPrinter(spooler, submission, number, uuid), {}};
                      });
}

void JobPrinting::Take(const PrintReply& reply, Order& order, Job& job,
                       const FolderConfiguration& folder) {
    if (reply.fault) {
        TakeFault(*reply.fault, order, job);
        return;
    }
    if (std::exchange(order.trouble, std::nullopt))
        order.delay = 0ms;
    order.next = Clock::now();
    if (reply.wantsPdf) {
        m_wantPdf.emplace(job.print.server, job.print.queue);
        Forget(job.print);
        GiveBack(job, {m_journal.Now(), m_journal.Shared() != nullptr}, 0s);
        order.isToBeTold = true;
    } else if (order.step == Step::Find) {
        TakeFound(reply, order, job, folder);
    } else if (order.step == Step::Send) {
        job.state = JobState::Printing;
        order.isToBeTold = true;
        LookLater(order);
    } else if (reply.job) {
        job.print.number = reply.job->number;
        job.print.uuid = reply.job->uuid;
        order.isEmpty = true;
        order.isToBeTold = true;
    } // or the job has gone again already
}

void JobPrinting::TakeFault(const Fault& fault, Order& order, Job& job) {
    if (fault.blame == Blame::Document) {
        Fail(order, job, fault);
        return;
    }
    if (!order.trouble)
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << Shown(job.source) << " is not printed yet: " << fault.Text();
    order.trouble = fault;
    order.delay = std::clamp(order.delay * 2, FirstTry, LastTry);
    order.next = Clock::now() + order.delay;
}

void JobPrinting::TakeFound(const PrintReply& reply, Order& order, Job& job,
                            const FolderConfiguration& folder) {
    using Progress = SpooledJob::Progress;
    if (!reply.job || reply.job->uuid != job.print.uuid) {
        TakeLoss(order, job, folder);
        return;
    }
    const SpooledJob& found = *reply.job;
    const bool isOver =
        found.progress == Progress::Completed || found.progress == Progress::Aborted;
    if (found.progress == Progress::Canceled || (isOver && found.documents > 0)) {
        TakeEnd(found, order, job, folder);
    } else if (found.documents == 0) {
        order.isEmpty = !isOver;
        if (isOver) { // it has waited for its document for too long
            Forget(job.print);
            order.isToBeTold = true;
        }
    } else {
        order.isToBeTold = job.state == JobState::Submitting || job.print.message != found.message;
        job.state = JobState::Printing;
        job.print.message = found.message;
        order.isStuck = found.progress == Progress::Stuck;
        LookLater(order);
    }
}

void JobPrinting::TakeEnd(const SpooledJob& found, Order& order, Job& job,
                          const FolderConfiguration& folder) {
    job.print.message = found.message;
    if (const std::optional<Fault> fault = WhyNotPrinted(found, job.print.queue)) {
        Fail(order, job, *fault);
        return;
    }
    job.fault.reset();
    job.text.clear();
    job.state = JobState::Delivering;
    if (!folder.print || !folder.print->keepsFiles)
        End(job, JobState::Finished, m_journal.Now());
    order.isToBeTold = true;
}

/// A person can see what has come out, and this program cannot. A second loss is no accident: a
/// server that keeps no history loses every job, on paper or not, and the paper would not end.
void JobPrinting::TakeLoss(Order& order, Job& job, const FolderConfiguration& folder) {
    const bool wasLost = job.fault.has_value();
    job.print.held = wasLost || !folder.print || !folder.print->printsLost;
    job.fault = LossOf(job, job.print.held);
    job.text = m_errorText(job.fault->code);
    SetLevelAndGetLogger(LevelError, __FILE__, __func__, __LINE__)
        << Shown(job.source) << ": " << job.fault->Text();
    Forget(job.print);
    job.state = JobState::Submitting;
    order.isToBeTold = true;
}

void JobPrinting::Fail(Order& order, Job& job, const Fault& fault) {
    job.fault = fault;
    job.text = m_errorText(fault.code);
    End(job, JobState::Failed, m_journal.Now());
    order.isToBeTold = true;
}

void JobPrinting::LookLater(Order& order) {
    order.delay = std::clamp(order.delay * 2, FirstLook, LastLook);
    order.next = Clock::now() + order.delay;
}

PrintDesk& JobPrinting::DeskOf(const wxString& server) {
    std::unique_ptr<PrintDesk>& desk = m_desks[server];
    if (!desk)
        desk = std::make_unique<PrintDesk>(server, m_onNews);
    return *desk;
}

bool JobPrinting::WantsPdf(const PrintTicket& ticket) const {
    return std::any_of(m_wantPdf.begin(), m_wantPdf.end(), [&ticket](const auto& known) {
        return known == std::pair(Spooler(ticket.server).Address(), ticket.queue);
    });
}

bool JobPrinting::IsBusy() const {
    return std::any_of(m_orders.begin(), m_orders.end(), [](const auto& entry) {
        return !entry.second.isStuck && !entry.second.trouble;
    });
}

std::size_t JobPrinting::CountOf(const wxString& folder) const {
    return static_cast<std::size_t>(
        std::count_if(m_orders.begin(), m_orders.end(),
                      [&folder](const auto& entry) { return entry.second.folder == folder; }));
}

std::optional<Fault> JobPrinting::TroubleOf(const wxString& folder) const {
    for (const auto& [number, order] : m_orders)
        if (order.folder == folder && order.trouble)
            return order.trouble;
    return std::nullopt;
}
