#include "tests/host/System.h"

#include <csignal>

void System::StopThisProcess() {
    std::raise(SIGSTOP);
}

void System::EndThisProcess() {
    std::raise(SIGKILL);
}
