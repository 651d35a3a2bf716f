#include "standins/office/inprocess/ModuleUse.h"

#include <atomic>

namespace standins {

namespace {

std::atomic<long> g_uses = 0;

} // namespace

ModuleUse::ModuleUse() {
    LockModule(true);
}

ModuleUse::~ModuleUse() {
    LockModule(false);
}

void LockModule(bool lock) {
    g_uses += lock ? 1 : -1;
}

bool IsModuleInUse() {
    return g_uses > 0;
}

} // namespace standins
