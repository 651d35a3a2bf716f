#include "host/program/linux/PrinterAbilities.h"

#include <wx/intl.h>

namespace {

/// Whether a value is among those of an attribute "…-supported".
bool IsAmong(ipp_attribute_t* supported, const std::string& option, const std::string& value) {
    switch (ippGetValueTag(supported)) {
    case IPP_TAG_INTEGER:
    case IPP_TAG_RANGE:
    case IPP_TAG_ENUM: {
        char* end = nullptr;
        long number = std::strtol(value.c_str(), &end, 10);
        if (*end != '\0' || value.empty())
            number = ippEnumValue(option.c_str(), value.c_str());
        return option == "job-priority" // which says how many levels there are
                   ? number >= 1 && number <= 100
                   : number > 0 && ippContainsInteger(supported, static_cast<int>(number)) != 0;
    }
    case IPP_TAG_KEYWORD:
    case IPP_TAG_NAME:
    case IPP_TAG_NAMELANG:
        return ippContainsString(supported, value.c_str()) != 0;
    default: // such as whether there are ranges of pages at all
        return true;
    }
}

/// Values of which a printer names only some: sizes of one's own, times, and pairs of sheets.
bool IsOpenEnded(const std::string& option, const std::string& value) {
    return (option == "media" &&
            (value.find("ustom") != std::string::npos || value.find(',') != std::string::npos)) ||
           (option == "job-hold-until" && value.find(':') != std::string::npos) ||
           (option == "job-sheets" && value.find(',') != std::string::npos);
}

} // namespace

std::optional<Fault> FindUnsupported(ipp_t* printer, const wxString& queue,
                                     const std::string& option, const std::string& value) {
    ipp_attribute_t* const supported =
        ippFindAttribute(printer, (option + "-supported").c_str(), IPP_TAG_ZERO);
    const wxString name = wxString::FromUTF8(option);
    if (!supported)
        return Fault{wxString::Format(_("the queue \"%s\" has no option \"%s\""), queue, name),
                     Blame::Usage};
    if (IsOpenEnded(option, value) || IsAmong(supported, option, value))
        return std::nullopt;
    char known[300] = {};
    ippAttributeString(supported, known, sizeof known);
    return Fault{wxString::Format(_("the queue \"%s\" cannot do \"%s\" for \"%s\"; it can: %s"),
                                  queue, wxString::FromUTF8(value), name,
                                  wxString::FromUTF8(known)),
                 Blame::Usage};
}
