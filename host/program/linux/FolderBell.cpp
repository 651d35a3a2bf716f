#include "host/program/system/FolderBell.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/inotify.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <limits>
#include <map>

namespace fs = std::filesystem;

namespace {

/// What is of interest in a folder. Files that are read, as by a scan, ring nothing.
constexpr std::uint32_t InFolder =
    IN_CREATE | IN_MOVED_TO | IN_CLOSE_WRITE | IN_DELETE | IN_MOVED_FROM | IN_ATTRIB;

class Descriptor {
public:
    explicit Descriptor(int number) : m_number(number) {}
    ~Descriptor() {
        if (m_number >= 0)
            close(m_number);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int operator*() const { return m_number; }

private:
    int m_number;
};

bool LiesBelow(const fs::path& path, const fs::path& folder) {
    return std::mismatch(folder.begin(), folder.end(), path.begin(), path.end()).first ==
           folder.end();
}

} // namespace

class FolderBell::System {
public:
    bool Watch(const fs::path& folder) {
        const int watch =
            inotify_add_watch(*m_events, folder.c_str(), InFolder | IN_MOVE_SELF | IN_ONLYDIR);
        const auto known = m_watches.find(folder);
        if (known != m_watches.end() && known->second != watch)
            Forget(folder);
        if (watch >= 0)
            m_watches[folder] = watch;
        return watch >= 0;
    }

    bool Wait(std::chrono::milliseconds longest) {
        pollfd ends[] = {{*m_events, POLLIN, 0}, {*m_rung, POLLIN, 0}};
        constexpr std::chrono::milliseconds Most{std::numeric_limits<int>::max()};
        const int time =
            static_cast<int>(std::clamp(longest, std::chrono::milliseconds::zero(), Most).count());
        if (poll(ends, std::size(ends), time) == 0)
            return false; // and where a signal came instead, there may be something to do
        eventfd_t rings = 0;
        eventfd_read(*m_rung, &rings);
        TakeEvents();
        return true;
    }

    void Ring() { eventfd_write(*m_rung, 1); }

private:
    void TakeEvents() {
        alignas(inotify_event) char bytes[16384];
        ssize_t length = 0;
        while ((length = read(*m_events, bytes, sizeof bytes)) > 0)
            for (ssize_t at = 0; at < length;) {
                const auto* const event = reinterpret_cast<const inotify_event*>(bytes + at);
                if (event->mask & (IN_MOVE_SELF | IN_IGNORED))
                    ForgetAll(event->wd);
                at += static_cast<ssize_t>(sizeof *event + event->len);
            }
    }

    /// A folder that has gone from where it was has taken those below it along.
    void ForgetAll(int watch) {
        const auto found = std::find_if(m_watches.begin(), m_watches.end(),
                                        [watch](const auto& each) { return each.second == watch; });
        if (found != m_watches.end())
            Forget(fs::path(found->first));
    }

    void Forget(const fs::path& folder) {
        for (auto each = m_watches.lower_bound(folder);
             each != m_watches.end() && LiesBelow(each->first, folder);
             each = m_watches.erase(each))
            inotify_rm_watch(*m_events, each->second);
    }

    const Descriptor m_events{inotify_init1(IN_NONBLOCK | IN_CLOEXEC)};
    const Descriptor m_rung{eventfd(0, EFD_NONBLOCK | EFD_CLOEXEC)};
    std::map<fs::path, int> m_watches; ///< paths compare by their parts: those below one follow it
};

FolderBell::FolderBell() : m_system(std::make_unique<System>()) {}

FolderBell::~FolderBell() = default;

bool FolderBell::Watch(const fs::path& folder) {
    return m_system->Watch(folder);
}

bool FolderBell::Wait(std::chrono::milliseconds longest) {
    return m_system->Wait(longest);
}

void FolderBell::Ring() {
    m_system->Ring();
}
