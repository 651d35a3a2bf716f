#include "host/program/system/Interruption.h"

#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <initializer_list>
#include <string>

namespace {

volatile std::sig_atomic_t g_requested = 0;

std::atomic<bool> g_reloadRequested{false};
static_assert(std::atomic<bool>::is_always_lock_free, "it is set by a signal");

std::atomic<const char*> g_note{nullptr};

extern "C" void NoteRequest(int signal) {
    if (g_requested != 0) {
        std::signal(signal, SIG_DFL);
        std::raise(signal);
        return;
    }
    g_requested = 1;
    const int error = errno;
    if (const char* const note = g_note) [[maybe_unused]]
        const ssize_t written = write(STDERR_FILENO, note, std::strlen(note));
    errno = error;
}

extern "C" void NoteReload(int) {
    g_reloadRequested = true;
}

extern "C" void DoNothing(int) {}

void Handle(int signal, void (*handler)(int)) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART;
    sigemptyset(&action.sa_mask);
    sigaction(signal, &action, nullptr);
}

/// A reader of our output that has gone, or a log that has become too large, is no reason to leave
/// documents unconverted. By a handler, not SIG_IGN, since programs started from here would inherit
/// that.
void IgnoreFailedWrites() {
    for (const int signal : {SIGPIPE, SIGXFSZ})
        Handle(signal, DoNothing);
}

} // namespace

void Interruption::Install() {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        Handle(signal, NoteRequest);
    IgnoreFailedWrites();
}

void Interruption::EndAtOnce() {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        Handle(signal, SIG_DFL);
    if (Requested())
        std::raise(SIGTERM);
}

void Interruption::SetNote(const wxString& note) {
    static std::string s_line;
    g_note = nullptr;
    s_line = "\nquillon: " + note.utf8_string() + '\n';
    g_note = s_line.c_str();
}

void Interruption::LeaveToParent() {
    sigset_t held; // by the parent, until now
    sigemptyset(&held);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        Handle(signal, DoNothing);
        sigaddset(&held, signal);
    }
    IgnoreFailedWrites();
    sigprocmask(SIG_UNBLOCK, &held, nullptr);
}

bool Interruption::Requested() {
    return g_requested != 0;
}

void Interruption::ReloadOnHangUp() {
    Handle(SIGHUP, NoteReload);
}

bool Interruption::ReloadRequested() {
    return g_reloadRequested.exchange(false);
}
