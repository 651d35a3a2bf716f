#include "standins/inprocess/HostRecord.h"

#include "standins/inprocess/Fonts.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/shared/Isolation.h"
#include "standins/shared/Text.h"

#include <sstream>

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

void LeaveFonts(const std::string& standIns) {
    std::wstring left =
        RegistryKey::Open(HKEY_CURRENT_USER, LastFontsKey).Text(FontsValue).value_or(L"");
    std::istringstream lines(standIns);
    for (std::string line; std::getline(lines, line);) {
        const std::string asked = line.substr(0, line.find('\t'));
        const std::string used = line.substr(asked.size() + 1);
        const std::wstring told =
            FromUtf8(line + (HasSameMetrics(asked, used) ? "\tmetric\n" : "\t\n"));
        if (left.find(told) == std::wstring::npos && !IsFontInstalled(asked))
            left += told;
    }
    if (!left.empty())
        RegistryKey::Create(HKEY_CURRENT_USER, LastFontsKey).SetText(FontsValue, left);
}

void EnterIsolation() {
    const Isolation isolation = LookAtIsolation();
    const RegistryKey key = RegistryKey::Create(HKEY_LOCAL_MACHINE, IsolationKey);
    key.SetText(L"Means", FromUtf8(isolation.means));
    key.SetText(L"Missing", FromUtf8(isolation.missing));
}

} // namespace standins
