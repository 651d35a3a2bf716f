#include "plugin/ScreeningRules.h"

#include "machine/OfficeApplication.h"
#include "office/CompoundFileCheck.h"
#include "office/InstalledApplications.h"
#include "office/OpenXmlCheck.h"

namespace {

struct ApplicationRules {
    OfficeApplication application;
    ScreeningRule legacy;
    ScreeningRule openXml;
};

const ApplicationRules Rules[] = {
    {OfficeApplication::Word,
     {nullptr, CheckWordCompoundFile},
     {IsWord12OrLater, CheckWordOpenXmlFile}},
    {OfficeApplication::Excel,
     {nullptr, CheckExcelCompoundFile},
     {IsExcel12OrLater, CheckExcelOpenXmlFile}},
    {OfficeApplication::PowerPoint,
     {nullptr, CheckPowerPointCompoundFile},
     {IsPowerPoint12OrLater, CheckPowerPointOpenXmlFile}},
    {OfficeApplication::Publisher, {nullptr, CheckPublisherFile}, {}}, // it has no such format
};

} // namespace

const ScreeningRule* FindScreeningRule(const wxString& extension) {
    const std::optional<OfficeApplication> application = ApplicationForExtension(extension);
    for (const ApplicationRules& rules : Rules)
        if (rules.application == application)
            return IsOpenXmlExtension(extension) ? &rules.openXml : &rules.legacy;
    return nullptr;
}
