#include "host/program/linux/PrinterAbilities.h"

#include "host/program/linux/PrinterDescription.h"

#include <wx/intl.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>

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

/// What the server's own programs understand, whatever the printer is.
constexpr const char* OfServer[] = {
    "collate",     "fit-to-page", "job-billing", "mirror",   "natural-scaling", "number-up-layout",
    "outputorder", "page-border", "page-set",    "position", "print-scaling",   "scaling"};

/// Paper by one of its names, such as "A4" or "Letter".
bool IsPaper(ipp_attribute_t* supported, const std::string& value) {
    const pwg_media_t* paper = pwgMediaForLegacy(value.c_str());
    if (!paper)
        paper = pwgMediaForPPD(value.c_str());
    return paper && ippContainsString(supported, paper->pwg) != 0;
}

/// The PPD's options that "media" stands for.
bool IsMediaOf(const PrinterDescription& description, const std::string& value) {
    return description.HasChoice("PageSize", value) || description.HasChoice("InputSlot", value) ||
           description.HasChoice("MediaType", value);
}

bool CanDo(ipp_attribute_t* supported, const PrinterDescription* description,
           const std::string& option, const std::string& value) {
    return IsOpenEnded(option, value) || IsAmong(supported, option, value) ||
           (option == "media" &&
            (IsPaper(supported, value) || (description && IsMediaOf(*description, value))));
}

/// Lengths on paper, in hundredths of a millimetre.
struct Paper {
    int width = 0;
    int length = 0;
};

constexpr int Alike = 150;

bool IsAlike(const Paper& a, const Paper& b) {
    return std::abs(a.width - b.width) <= Alike && std::abs(a.length - b.length) <= Alike;
}

Paper Turned(const Paper& paper) {
    return {paper.length, paper.width};
}

/// @return no size for what is no name of one
Paper PaperOf(const char* name) {
    const pwg_media_t* const paper = name ? pwgMediaForPWG(name) : nullptr;
    return paper ? Paper{paper->width, paper->length} : Paper();
}

/// The limits of the sizes that it takes besides those that have names.
Paper LimitOf(ipp_attribute_t* supported, const std::string& begin) {
    for (int i = 0; i < ippGetCount(supported); ++i) {
        const char* const name = ippGetString(supported, i, nullptr);
        if (name && std::string(name).rfind(begin, 0) == 0)
            return PaperOf(name);
    }
    return {};
}

bool IsWithin(const Paper& paper, const Paper& least, const Paper& most) {
    return paper.width >= least.width && paper.length >= least.length &&
           paper.width <= most.width && paper.length <= most.length;
}

/// A name for paper of any size that the printer takes.
std::string CustomMedia(ipp_attribute_t* supported, Paper paper) {
    const Paper least = LimitOf(supported, "custom_min");
    const Paper most = LimitOf(supported, "custom_max");
    if (!IsWithin(paper, least, most))
        paper = Turned(paper);
    char name[128] = {};
    if (!IsWithin(paper, least, most) ||
        !pwgFormatSizeName(name, sizeof name, "custom", nullptr, paper.width, paper.length, "mm"))
        return {};
    return name;
}

Fault NoOption(const wxString& queue, const std::string& option) {
    return {wxString::Format(_("the queue \"%s\" has no option \"%s\""), queue,
                             wxString::FromUTF8(option)),
            Blame::Usage};
}

} // namespace

std::optional<Fault> FindUnsupported(ipp_t* printer, const PrinterDescription* description,
                                     const wxString& queue, const std::string& option,
                                     const std::string& value) {
    ipp_attribute_t* const supported =
        ippFindAttribute(printer, (option + "-supported").c_str(), IPP_TAG_ZERO);
    const bool isDescribed = !supported && description && description->HasOption(option);
    if (!supported && !isDescribed)
        return std::find(std::begin(OfServer), std::end(OfServer), option) == std::end(OfServer)
                   ? std::optional(NoOption(queue, option))
                   : std::nullopt;
    if (isDescribed ? value.rfind("Custom.", 0) == 0 || description->HasChoice(option, value)
                    : CanDo(supported, description, option, value))
        return std::nullopt;
    char known[300] = {};
    if (supported)
        ippAttributeString(supported, known, sizeof known);
    return Fault{
        wxString::Format(_("the queue \"%s\" cannot do \"%s\" for \"%s\"; it can: %s"), queue,
                         wxString::FromUTF8(value), wxString::FromUTF8(option),
                         isDescribed ? description->ChoicesOf(option) : wxString::FromUTF8(known)),
        Blame::Usage};
}

std::string MediaFor(ipp_t* printer, const PageSize& pages) {
    constexpr double Hundredths = 2540.0 / 72;
    const Paper wanted = {static_cast<int>(std::lround(pages.width * Hundredths)),
                          static_cast<int>(std::lround(pages.height * Hundredths))};
    ipp_attribute_t* const supported = ippFindAttribute(printer, "media-supported", IPP_TAG_ZERO);
    if (!supported || wanted.width <= 0 || wanted.length <= 0)
        return {};
    for (const Paper& way : {wanted, Turned(wanted)})
        for (int i = 0; i < ippGetCount(supported); ++i) {
            const char* const name = ippGetString(supported, i, nullptr);
            if (name && std::string(name).rfind("custom_m", 0) != 0 && IsAlike(PaperOf(name), way))
                return name;
        }
    return CustomMedia(supported, wanted);
}
