#include "host/program/Interruption.h"

#include <csignal>
#include <initializer_list>

namespace {

volatile std::sig_atomic_t g_requested = 0;

extern "C" void NoteRequest(int) {
    g_requested = 1;
}

extern "C" void IgnoreBrokenPipe(int) {}

void Handle(int signal, void (*handler)(int), int flags) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART | flags;
    sigemptyset(&action.sa_mask);
    sigaction(signal, &action, nullptr);
}

} // namespace

void Interruption::Install() {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        Handle(signal, NoteRequest, static_cast<int>(SA_RESETHAND));
    // A reader of our output that has gone is no reason to leave documents unconverted. A handler,
    // not SIG_IGN, since programs started from here would inherit that.
    Handle(SIGPIPE, IgnoreBrokenPipe, 0);
}

bool Interruption::Requested() {
    return g_requested != 0;
}
