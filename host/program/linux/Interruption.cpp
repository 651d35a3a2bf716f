#include "host/program/system/Interruption.h"

#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <initializer_list>

namespace {

volatile std::sig_atomic_t g_requested = 0;

constexpr char Note[] = "\nquillon: finishing what is under way; a second Ctrl-C ends at once\n";

extern "C" void NoteRequest(int signal) {
    if (g_requested != 0) {
        std::signal(signal, SIG_DFL);
        std::raise(signal);
        return;
    }
    g_requested = 1;
    const int error = errno;
    [[maybe_unused]] const ssize_t written = write(STDERR_FILENO, Note, sizeof Note - 1);
    errno = error;
}

extern "C" void DoNothing(int) {}

void Handle(int signal, void (*handler)(int)) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART;
    sigemptyset(&action.sa_mask);
    sigaction(signal, &action, nullptr);
}

} // namespace

void Interruption::Install() {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        Handle(signal, NoteRequest);
    // A reader of our output that has gone is no reason to leave documents unconverted. A handler,
    // not SIG_IGN, since programs started from here would inherit that.
    Handle(SIGPIPE, DoNothing);
}

void Interruption::LeaveToParent() {
    sigset_t held; // by the parent, until now
    sigemptyset(&held);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE}) {
        Handle(signal, DoNothing);
        sigaddset(&held, signal);
    }
    sigprocmask(SIG_UNBLOCK, &held, nullptr);
}

bool Interruption::Requested() {
    return g_requested != 0;
}
