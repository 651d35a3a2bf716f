#include "host/program/printserver/JobSettings.h"

#include "host/program/base/PathText.h"
#include "host/program/settings/KnownSettings.h"

#include <wx/intl.h>

#include <algorithm>
#include <fstream>

namespace {

/// A name or a value without what people write in many ways: case, and what joins words.
wxString Plain(const wxString& text) {
    wxString plain;
    for (const wxUniChar letter : text.Upper())
        if (wxString(" -_").find(letter) == wxString::npos)
            plain += letter;
    return plain;
}

struct Word {
    const char* option;
    const char* means;
};

/// Values of "print-color-mode", which all printers have; the others mean colours.
constexpr Word ColourModes[] = {
    {"MONOCHROME", "Grayscale"},
    {"AUTOMONOCHROME", "Grayscale"},
    {"PROCESSMONOCHROME", "Grayscale"},
    {"BILEVEL", "Pure Black and White"},
    {"PROCESSBILEVEL", "Pure Black and White"},
};

constexpr Word Flags[] = {{"TRUE", "1"},  {"YES", "1"}, {"ON", "1"},  {"1", "1"},
                          {"FALSE", "0"}, {"NO", "0"},  {"OFF", "0"}, {"0", "0"}};

/// @return null when it is none of the words
template <std::size_t Count>
const char* Find(const Word (&words)[Count], const wxString& plain) {
    const auto* const found = std::find_if(
        words, words + Count, [&plain](const Word& word) { return plain == word.option; });
    return found == words + Count ? nullptr : found->means;
}

/// Whether a job may say it. The output is the print server's, the printer too.
bool IsOfJob(const Setting& setting) {
    return setting.kind != Setting::Printer && setting.kind != Setting::Profile &&
           &setting != &FilterSettings::OutputPS && &setting != &FilterSettings::OutputPDF;
}

/// @return null when it is none of them
const Setting* FindJobSetting(const wxString& plainName) {
    const auto* const found =
        std::find_if(std::begin(FilterSettings::All), std::end(FilterSettings::All),
                     [&](const Setting* each) { return IsOfJob(*each) && plainName == each->key; });
    return found == std::end(FilterSettings::All) ? nullptr : *found;
}

/// @return the setting's value as it is stored; nothing when it cannot have it
std::optional<std::string> ValueFor(const Setting& setting, const wxString& value) {
    const wxString plain = Plain(value);
    if (setting.kind == Setting::Flag) {
        const char* const flag = Find(Flags, plain);
        return flag ? std::optional<std::string>(flag) : std::nullopt;
    }
    for (const SettingChoice& choice : setting.choices)
        if (plain == Plain(choice.text))
            return choice.text;
    return std::nullopt;
}

wxString ListOf(const Setting& setting) {
    wxString list;
    for (const wxString& value : ValuesOf(setting))
        list << (list.empty() ? "" : ", ") << value;
    return list;
}

/// Settings as they come together.
class JobSettings {
public:
    void Add(const Setting& setting, const std::string& value) {
        m_assignments.push_back(std::string(setting.key) + '=' + value);
    }

    /// @return that the setting cannot have the value
    std::optional<Fault> Take(const std::string& name, const Setting& setting,
                              const std::string& value) {
        if (const auto stored = ValueFor(setting, wxString::FromUTF8(value))) {
            Add(setting, *stored);
            return std::nullopt;
        }
        return Fault{
            wxString::Format(_("the option %s cannot be \"%s\""), Shown(FromArgument(name)),
                             Shown(FromArgument(value)).Left(LongestShown)),
            Blame::Usage, ConversionFailed, wxString::Format(_("It can be: %s"), ListOf(setting))};
    }

    std::vector<std::string> Result() && { return std::move(m_assignments); }

private:
    static constexpr std::size_t LongestShown = 40;

    std::vector<std::string> m_assignments;
};

} // namespace

std::set<std::string> OptionsOfPrinter(const std::string& ppd) {
    constexpr std::string_view Begin = "*OpenUI *";
    std::set<std::string> names;
    std::ifstream file(ppd);
    for (std::string line; std::getline(file, line);)
        if (line.rfind(Begin, 0) == 0)
            names.insert(Plain(line.substr(Begin.size(),
                                           line.find_first_of(":/ ", Begin.size()) - Begin.size()))
                             .utf8_string());
    return names;
}

std::optional<std::vector<std::string>>
SettingsOfJob(const JobOptions& options, const std::set<std::string>& ofPrinter, Fault& fault) {
    JobSettings settings;
    if (const auto mode = options.find("print-color-mode"); mode != options.end())
        if (const char* const colour = Find(ColourModes, Plain(mode->second)))
            settings.Add(FilterSettings::Colour, colour);
    for (const auto& [name, value] : options) {
        const wxString plain = Plain(wxString::FromUTF8(name));
        if (ofPrinter.count(plain.utf8_string()) != 0)
            continue;
        std::optional<Fault> wrong;
        if (const Setting* const setting = FindJobSetting(plain)) {
            wrong = settings.Take(name, *setting, value);
        } else if (plain == Plain(FilterSettings::Handouts)) {
            settings.Add(FilterSettings::OutputType, FilterSettings::Handouts);
            wrong = settings.Take(name, FilterSettings::SlidesPerPage, value);
        }
        if (wrong) {
            fault = *wrong;
            return std::nullopt;
        }
    }
    return std::move(settings).Result();
}
