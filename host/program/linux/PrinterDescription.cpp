#include "host/program/linux/PrinterDescription.h"

#include <cups/cups.h>

#include <algorithm>
#include <cstdio>
#include <vector>

// The library calls these files old. As long as its server has printers by them, they say what
// nothing else does.
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

namespace {

/// What the server has between itself and the printer, by the types of files it takes.
std::vector<std::string> FiltersOf(ppd_file_t* file) {
    std::vector<std::string> filters;
    for (const ppd_attr_t* filter = ppdFindAttr(file, "cupsFilter2", nullptr); filter;
         filter = ppdFindNextAttr(file, "cupsFilter2", nullptr))
        filters.emplace_back(filter->value ? filter->value : "");
    if (filters.empty())
        filters.assign(file->filters, file->filters + file->num_filters);
    return filters;
}

ppd_option_t* Find(const std::unique_ptr<ppd_file_t, void (*)(ppd_file_t*)>& file,
                   const std::string& option) {
    return ppdFindOption(file.get(), option.c_str());
}

} // namespace

std::optional<PrinterDescription> PrinterDescription::Fetch(http_t* server, const wxString& queue) {
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> copy(std::tmpfile(), std::fclose);
    const std::string resource = "/printers/" + queue.utf8_string() + ".ppd";
    if (!copy || cupsGetFd(server, resource.c_str(), fileno(copy.get())) != HTTP_STATUS_OK)
        return std::nullopt;
    std::rewind(copy.get());
    File file(ppdOpen(copy.get()), ppdClose);
    return file ? std::optional(PrinterDescription(std::move(file))) : std::nullopt;
}

bool PrinterDescription::TakesPostScript() const {
    const std::vector<std::string> filters = FiltersOf(m_file.get());
    return filters.empty() || std::any_of(filters.begin(), filters.end(), [](const auto& filter) {
               const std::string type = filter.substr(0, filter.find(' '));
               return type == "application/vnd.cups-postscript" || type == "application/postscript";
           });
}

bool PrinterDescription::HasOption(const std::string& option) const {
    return Find(m_file, option) != nullptr;
}

bool PrinterDescription::HasChoice(const std::string& option, const std::string& choice) const {
    ppd_option_t* const found = Find(m_file, option);
    // Of a choice of one's own, such as "Custom.100x200mm", the server tells whether it can be.
    return found && ppdFindChoice(found, choice.c_str());
}

wxString PrinterDescription::ChoicesOf(const std::string& option) const {
    wxString list;
    if (const ppd_option_t* const found = Find(m_file, option))
        for (int i = 0; i < found->num_choices; ++i)
            list << (list.empty() ? "" : ",") << wxString::FromUTF8(found->choices[i].choice);
    return list;
}
