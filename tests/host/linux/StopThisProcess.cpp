#include "tests/host/System.h"

#include <csignal>

void System::StopThisProcess() {
    std::raise(SIGSTOP);
}
