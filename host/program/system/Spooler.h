#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

/// How a document is to be printed, and where.
struct PrintTicket {
    wxString server; ///< HOST:PORT or a socket's path; empty for the one that the user has
    wxString queue;
    std::map<std::string, std::string> options; ///< by the names that the print server has for them
};

/// A job of a print server's, as it is at the moment.
struct SpooledJob {
    enum class Progress {
        Waiting,
        Working,
        Stuck,     ///< until somebody does something about it, or the printer is back
        Completed, ///< on paper
        Aborted,
        Canceled,
    };

    int number = 0;
    wxString name;
    wxString uuid; ///< tells it from another one that gets the same number
    int documents = 0;
    Progress progress = Progress::Waiting;
    wxString message; ///< in the server's words; may be empty
};

/// What a queue does with a document's files.
struct PrintWay {
    std::vector<std::string> types; ///< MIME types that it takes, the best first
    std::string media;              ///< its paper of the pages' size; empty when it has none
};

/// A size of pages, in points.
struct PageSize {
    double width = 0;
    double height = 0;
};

/// A print server, as its clients see it. Faults with Blame::Machine and Blame::Usage pass, the
/// latter when somebody has mended what is wrong; those of the document stay. A call returns within
/// seconds, whatever the server does. An object is for one thread.
class Spooler {
public:
    /// Whether there are print servers for this system at all.
    static bool IsAvailable();

    /// @param server see PrintTicket
    explicit Spooler(const wxString& server) : m_server(server) {}

    /// What is asked for in vain: a queue that takes jobs, or what its printer cannot do.
    std::optional<Fault> Check(const PrintTicket& ticket);

    /// How the queue prints pages of a size.
    /// @param types MIME types that there could be
    /// @return nothing when it cannot be asked, or takes none of them
    std::optional<PrintWay> FindWay(const wxString& queue, const std::vector<std::string>& types,
                                    const PageSize& pages, Fault& fault);

    /// Makes a job without a document.
    /// @return its number
    std::optional<int> Create(const PrintTicket& ticket, const wxString& name, Fault& fault);

    /// Gives a job its only document.
    std::optional<Fault> Send(const wxString& queue, int number, const std::filesystem::path& file,
                              const std::string& type);

    /// @return the job in a list, or an empty one when the server knows no such job; nothing when
    ///     it cannot be asked
    std::optional<std::vector<SpooledJob>> Find(int number, Fault& fault);

    /// The user's jobs in a queue that are not over.
    std::optional<std::vector<SpooledJob>> Unfinished(const wxString& queue, Fault& fault);

    std::optional<Fault> Cancel(int number);

    /// Which server it is, when no other is named.
    wxString Address();

private:
    std::shared_ptr<void> Connection(Fault& fault);
    void LetGo() { m_connection.reset(); }

    wxString m_server;
    std::shared_ptr<void> m_connection; ///< null until it is needed
};
