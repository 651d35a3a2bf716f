#include "standins/office/supervisor/FontStandIns.h"

#include "standins/office/shared/TextLibraryNames.h"
#include "standins/shared/FileBytes.h"
#include "standins/shared/Text.h"

#include <glib.h>

#include <algorithm>
#include <memory>
#include <set>
#include <sstream>

namespace standins {

namespace {

/// A document may name any number of fonts; nobody reads hundreds.
constexpr std::size_t Most = 40;
constexpr std::size_t LongestName = 80;

std::string WithoutStyle(const std::string& name) {
    return name.substr(0, name.rfind('/'));
}

/// Whether LibreOffice has put the name there itself. A document names one font, and at most
/// another instead; LibreOffice's own, for what a document does not say, are long lists. StarSymbol
/// is its name for the font of bullets.
bool IsLibreOfficesOwn(const std::string& asked) {
    return std::count(asked.begin(), asked.end(), ';') > 1 || asked == "StarSymbol";
}

bool IsSameName(const std::string& one, const std::string& other) {
    const std::unique_ptr<char, decltype(&g_free)> folded(g_utf8_casefold(one.c_str(), -1), g_free);
    const std::unique_ptr<char, decltype(&g_free)> otherFolded(g_utf8_casefold(other.c_str(), -1),
                                                               g_free);
    return g_strcmp0(folded.get(), otherFolded.get()) == 0;
}

/// @return empty when the font asked for is the one that is used, or nobody has asked for it
std::string StandInOf(const std::string& use) {
    const std::size_t tab = use.find('\t');
    if (tab == std::string::npos)
        return {};
    const std::string list = WithoutStyle(use.substr(0, tab));
    const std::string asked = list.substr(0, list.find(';'));
    const std::string used = WithoutStyle(use.substr(tab + 1));
    if (asked.empty() || used.empty() || asked.size() > LongestName || used.size() > LongestName ||
        IsLibreOfficesOwn(list) || IsSameName(asked, used))
        return {};
    return asked + '\t' + used + '\n';
}

} // namespace

std::string ReadFontStandIns(const std::string& folder) {
    constexpr std::size_t LongEnough = std::size_t{256} << 10;
    const std::string bytes = ReadText(folder + '/' + FontUseFile, LongEnough);
    const std::u16string text(reinterpret_cast<const char16_t*>(bytes.data()),
                              bytes.size() / sizeof(char16_t));
    std::istringstream uses(FromUtf16(text).value_or(std::string()));
    std::set<std::string> standIns;
    for (std::string use; standIns.size() < Most && std::getline(uses, use);)
        standIns.insert(StandInOf(use));
    standIns.erase("");
    std::string lines;
    for (const std::string& standIn : standIns)
        lines += standIn;
    return lines;
}

} // namespace standins
