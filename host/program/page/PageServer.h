#pragma once

#include "host/program/base/Fault.h"
#include "host/program/watch/WatchStatus.h"

#include <functional>
#include <memory>
#include <string>

/// A watch over HTTP: a page for people at "/", whether all is well at "/healthz", and figures for
/// Prometheus at "/metrics". It serves in threads of its own, and sees the watch through its status
/// board and the journal alone: it answers however busy the watch is.
class PageServer {
public:
    /// @param address HOST:PORT
    /// @param journal as OpenJournal takes it
    /// @param board outlives the server
    /// @param onRequest called, in a thread of the server's, when somebody has asked for what the
    /// journal now says:
    ///     a document to be tried again, a folder to be paused
    /// @param fault receives why there is none
    static std::unique_ptr<PageServer> Start(const std::string& address, const std::string& journal,
                                             const StatusBoard& board,
                                             std::function<void()> onRequest, Fault& fault);
    /// Stops serving.
    virtual ~PageServer() = default;

    /// An event for the figures that no journal has.
    /// @param state as records name it
    /// @param application the document's, by its name; empty when there is none
    virtual void Count(const wxString& folder, const char* state, int code,
                       const wxString& application, double seconds) = 0;
    virtual void CountRetry(const wxString& folder) = 0;
};
