#include "standins/shared/DefaultSignals.h"

#include <csignal>

namespace standins {

void RestoreDefaultSignals() {
    for (int number = 1; number < SIGRTMAX; ++number)
        signal(number, SIG_DFL);
    sigset_t none;
    sigemptyset(&none);
    sigprocmask(SIG_SETMASK, &none, nullptr);
}

} // namespace standins
