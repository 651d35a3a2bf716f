#pragma once

#include "host/program/watch/FolderConfiguration.h"

#include <chrono>
#include <mutex>
#include <optional>
#include <vector>

/// How a watched folder is at the moment.
struct FolderStatus {
    FolderConfiguration configuration;
    bool reachable = false; ///< its folders can be seen
    wxString obstacle; ///< why none of its documents is begun, in the program's language; or empty
    bool paused = false;          ///< by a person
    std::size_t settling = 0;     ///< files that are there, but may still be written to
    std::uintmax_t freeBytes = 0; ///< where the output goes
};

/// A document under way.
struct RunningDocument {
    std::int64_t job = 0;
    wxString folder;
    wxString name;
    wxString step; ///< may be empty
    int percent = 0;
    std::chrono::steady_clock::time_point since;
};

/// How a watch is at the moment.
struct WatchStatus {
    std::chrono::system_clock::time_point started;
    std::chrono::steady_clock::time_point lastPass; ///< through all that it has to look after
    wxString journalFault; ///< why the journal cannot be read or written; or empty
    bool draining = false; ///< finishes what is under way, and ends
    std::vector<FolderStatus> folders;
    std::vector<RunningDocument> running;
};

/// Where the watch puts its status, and others take it from; for any thread.
class StatusBoard {
public:
    void Put(WatchStatus status) {
        const std::lock_guard lock(m_mutex);
        m_status = std::move(status);
    }
    WatchStatus Get() const {
        const std::lock_guard lock(m_mutex);
        return m_status;
    }

private:
    mutable std::mutex m_mutex;
    WatchStatus m_status;
};
