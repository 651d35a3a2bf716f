#include "office/OfficeApplication.h"

namespace {

struct ServedExtension {
    const char* extension;
    OfficeApplication application;
};

const ServedExtension ServedExtensions[] = {
    {"doc", OfficeApplication::Word},       {"docx", OfficeApplication::Word},
    {"xls", OfficeApplication::Excel},      {"xlsx", OfficeApplication::Excel},
    {"ppt", OfficeApplication::PowerPoint}, {"pptx", OfficeApplication::PowerPoint},
    {"pps", OfficeApplication::PowerPoint}, {"ppsx", OfficeApplication::PowerPoint},
    {"pub", OfficeApplication::Publisher},
};

} // namespace

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
    for (const ServedExtension& served : ServedExtensions)
        if (extension.IsSameAs(served.extension, false))
            return served.application;
    return std::nullopt;
}
