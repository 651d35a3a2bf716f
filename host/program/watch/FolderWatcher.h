#pragma once

#include "host/program/system/FolderBell.h"
#include "host/program/watch/FolderLock.h"
#include "host/program/watch/FolderScan.h"

#include <atomic>
#include <mutex>
#include <thread>

/// Watches one folder in a thread of its own, since a share may take its time to answer, or never
/// do. It touches nothing but the folders' names: what is found is handed on. Where another machine
/// finds the documents, it only looks whether the folder can be reached from this one.
class FolderWatcher {
public:
    /// @param extensions of documents, in lower case, without dots
    /// @param digests whether other machines are to know what is found
    /// @param wasUsed whether the folder had documents before: then it is not the right one, but
    ///     the place where a share is to be mounted, when nothing in it says so
    /// @param onNews called in the thread when there is something to take
    FolderWatcher(const FolderConfiguration& configuration, std::set<std::string> extensions,
                  bool digests, bool wasUsed, std::function<void()> onNews);
    ~FolderWatcher();
    FolderWatcher(const FolderWatcher&) = delete;
    FolderWatcher& operator=(const FolderWatcher&) = delete;

    /// How it is.
    struct View {
        bool hasLooked = false;       ///< at all
        std::optional<Fault> fault;   ///< why the folder cannot be watched at the moment
        bool awaitsAdmission = false; ///< it can be, again or for the first time
        std::size_t settling = 0;
        std::size_t scans = 0;        ///< that were whole
        std::uintmax_t freeBytes = 0; ///< for output
    };
    View Look() const;

    /// What has settled since the last call.
    std::vector<SettledFile> Take();

    /// Lets it scan: what was left of earlier work is put away.
    void Admit();

    /// Has all files that are there found anew.
    void Forget();

private:
    using Clock = std::chrono::steady_clock;

    void Run();
    std::optional<Fault> Open();
    std::optional<Fault> TakePossession();
    void Scan();
    ScanResult LookForDocuments(Clock::time_point now);
    void Close(Fault fault);
    FolderScan::Rules MakeRules();
    void AwaitNextLook();
    void StayAlive() { m_alive = Clock::now().time_since_epoch().count(); }

    const FolderConfiguration m_configuration;
    const std::set<std::string> m_extensions;
    const bool m_digests;
    const std::function<void()> m_onNews;

    // The thread's own.
    bool m_wasUsed;
    bool m_isShare = false;
    std::uint64_t m_device = 0;
    std::optional<FolderLock> m_lock;
    std::optional<FolderScan> m_scan;
    std::optional<std::chrono::milliseconds> m_next; ///< after the last scan
    std::chrono::milliseconds m_lastScanTook{0};
    Clock::time_point m_lastScan;
    std::chrono::seconds m_backoff{1};

    FolderBell m_bell;
    std::atomic<Clock::rep> m_alive; ///< its last sign of life
    std::atomic<bool> m_stopping{false};
    std::atomic<bool> m_admitted{false};
    std::atomic<bool> m_forgetful{false};

    mutable std::mutex m_mutex; ///< of what follows
    View m_view;
    std::vector<SettledFile> m_settled;

    std::thread m_thread; // last: it uses all of the above
};
