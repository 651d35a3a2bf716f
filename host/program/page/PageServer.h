#pragma once

#include "host/program/base/Fault.h"
#include "host/program/journal/Journal.h"
#include "host/program/watch/WatchStatus.h"

#include <functional>
#include <memory>
#include <string>

/// Opens the journal anew, in whatever thread needs it.
/// @param fault receives why there is none
using JournalOpener = std::function<std::unique_ptr<Journal>(Fault& fault)>;

/// A watch over HTTP: a page for people at "/", whether all is well at "/healthz", and figures for
/// Prometheus at "/metrics". It serves in threads of its own, and sees the watch through its status
/// board and the journal alone: it answers however busy the watch is. There are no passwords:
/// where others can reach it, a proxy in front asks for them.
class PageServer {
public:
    /// To be called by the thread that has set the program's language.
    /// @param address HOST:PORT; port 0 is any that is free
    /// @param board outlives the server
    /// @param onRequest called, in a thread of the server's, when somebody has asked for what the
    /// journal now says: a document to be tried again, a folder to be paused
    /// @param fault receives why there is none
    static std::unique_ptr<PageServer> Start(const std::string& address, JournalOpener journal,
                                             const StatusBoard& board,
                                             std::function<void()> onRequest, Fault& fault);
    /// Stops serving.
    virtual ~PageServer() = default;

    /// HOST:PORT, as it has become.
    virtual std::string Address() const = 0;

    /// An event for the figures that no journal has.
    /// @param state as records name it
    /// @param application the document's, by its name; empty when there is none
    virtual void Count(const wxString& folder, const char* state, int code,
                       const wxString& application, double seconds) = 0;
    virtual void CountRetry(const wxString& folder) = 0;
};
