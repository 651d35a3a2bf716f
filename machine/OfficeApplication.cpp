#include "machine/OfficeApplication.h"

namespace {

enum class Format { Legacy, OpenXml };

struct ServedExtension {
    const char* extension;
    OfficeApplication application;
    Format format;
};

const ServedExtension ServedExtensions[] = {
    {"doc", OfficeApplication::Word, Format::Legacy},
    {"docx", OfficeApplication::Word, Format::OpenXml},
    {"xls", OfficeApplication::Excel, Format::Legacy},
    {"xlsx", OfficeApplication::Excel, Format::OpenXml},
    {"ppt", OfficeApplication::PowerPoint, Format::Legacy},
    {"pptx", OfficeApplication::PowerPoint, Format::OpenXml},
    {"pps", OfficeApplication::PowerPoint, Format::Legacy},
    {"ppsx", OfficeApplication::PowerPoint, Format::OpenXml},
    {"pub", OfficeApplication::Publisher, Format::Legacy},
};

/// @return null when no application serves the extension
const ServedExtension* Find(const wxString& extension) {
    for (const ServedExtension& served : ServedExtensions)
        if (extension.IsSameAs(served.extension, false))
            return &served;
    return nullptr;
}

} // namespace

const char* NameOf(OfficeApplication application) {
    switch (application) {
    case OfficeApplication::Word:
        return "Word";
    case OfficeApplication::Excel:
        return "Excel";
    case OfficeApplication::PowerPoint:
        return "PowerPoint";
    case OfficeApplication::Publisher:
        return "Publisher";
    }
    return "";
}

const wchar_t* ProgIdOf(OfficeApplication application) {
    switch (application) {
    case OfficeApplication::Word:
        return L"Word.Application";
    case OfficeApplication::Excel:
        return L"Excel.Application";
    case OfficeApplication::PowerPoint:
        return L"PowerPoint.Application";
    case OfficeApplication::Publisher:
        return L"Publisher.Application";
    }
    return L"";
}

std::optional<OfficeApplication> ApplicationForExtension(const wxString& extension) {
    const ServedExtension* const served = Find(extension);
    return served ? std::optional(served->application) : std::nullopt;
}

bool IsOpenXmlExtension(const wxString& extension) {
    const ServedExtension* const served = Find(extension);
    return served && served->format == Format::OpenXml;
}
