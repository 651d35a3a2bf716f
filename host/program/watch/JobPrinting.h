#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/printing/PrintDesk.h"
#include "host/program/watch/WatchConfiguration.h"

#include <set>

/// Brings documents to print servers, and follows them there. Each step is told to the journal
/// before the next one, so that whoever finds the journal after the program was ended asks the
/// server what it has, and goes on from there. Its calls do not wait for a server.
class JobPrinting {
public:
    /// @param errorText the message of a result code
    /// @param onNews called in other threads when a job may be taken further
    JobPrinting(Journal& journal, std::function<wxString(int)> errorText,
                std::function<void()> onNews)
        : m_journal(journal), m_errorText(std::move(errorText)), m_onNews(std::move(onNews)) {}

    /// Takes a job further, if its server has answered. Throws JournalError, and JobLost; the next
    /// call goes on from there.
    /// @param ticket tells the job from all others, as a journal may give its numbers again
    /// @param job Submitting or Printing; afterwards also Delivering, Finished, Failed or Waiting
    /// @return whether it is one of the latter, and the journal knows
    bool Advance(std::int64_t ticket, Job& job, const FolderConfiguration& folder);

    /// Lets go of a job that somebody else has now.
    void LetGo(std::int64_t ticket) { m_orders.erase(ticket); }

    /// Whether a queue has been met that prints PDF as it is, and not what applications print.
    bool WantsPdf(const PrintTicket& ticket) const;

    /// Whether anything comes further without somebody's help, or that of time.
    bool IsBusy() const;

    /// How many documents of a folder are not on paper yet.
    std::size_t CountOf(const wxString& folder) const;
    /// Why its print server cannot be used at the moment.
    std::optional<Fault> TroubleOf(const wxString& folder) const;

private:
    using Clock = std::chrono::steady_clock;
    enum class Step { Make, Send, Find };

    /// A job, as far as this program has it in hand.
    struct Order {
        wxString folder;
        Step step = Step::Find; ///< that is being done, or was done last
        std::future<PrintReply> reply;
        bool isToBeTold = false; ///< to the journal
        bool isEmpty = false;    ///< the server has said that it has no document yet
        bool isStuck = false;
        std::optional<Fault> trouble;
        Clock::time_point next;
        std::chrono::milliseconds delay{};
    };

    void Reconsider(Order& order, Job& job, const FolderConfiguration& folder);
    void Begin(Order& order, Job& job, const FolderConfiguration& folder);
    void Take(const PrintReply& reply, Order& order, Job& job, const FolderConfiguration& folder);
    void TakeFault(const Fault& fault, Order& order, Job& job);
    void TakeFound(const PrintReply& reply, Order& order, Job& job,
                   const FolderConfiguration& folder);
    void TakeEnd(const SpooledJob& found, Order& order, Job& job,
                 const FolderConfiguration& folder);
    void TakeLoss(Order& order, Job& job, const FolderConfiguration& folder);
    void Fail(Order& order, Job& job, const Fault& fault);
    static void LookLater(Order& order);
    PrintDesk& DeskOf(const wxString& server);

    Journal& m_journal;
    const std::function<wxString(int)> m_errorText;
    const std::function<void()> m_onNews;
    std::map<std::int64_t, Order> m_orders;                 ///< by their tickets
    std::map<wxString, std::unique_ptr<PrintDesk>> m_desks; ///< by the server
    std::set<std::pair<wxString, wxString>> m_wantPdf;      ///< servers and queues
};

/// What a folder asks for, for one of its documents.
PrintTicket TicketFor(const Job& job, const FolderConfiguration& folder);
