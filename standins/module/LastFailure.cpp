#include "standins/module/LastFailure.h"

#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"

namespace standins {

namespace {

const wchar_t* NameOf(Fault fault) {
    switch (fault) {
    case Fault::Machine:
        return L"machine";
    case Fault::Outside:
        return L"outside";
    default:
        return L"document";
    }
}

} // namespace

void LeaveFailure(const Failure& failure) {
    const RegistryKey key = RegistryKey::Create(HKEY_CURRENT_USER, LastFailureKey);
    key.SetText(FailureReasonValue, FromUtf8(failure.reason));
    key.SetText(FailureFaultValue, NameOf(failure.fault));
}

} // namespace standins
