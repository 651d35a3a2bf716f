#include "standins/module/LastFonts.h"

#include "standins/module/InstalledFonts.h"
#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"

#include <sstream>

namespace standins {

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

} // namespace standins
