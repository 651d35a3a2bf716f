#include "plugin/ScreeningRules.h"

#include "office/CompoundFileCheck.h"
#include "office/InstalledApplications.h"
#include "office/OpenXmlCheck.h"

namespace {

const ScreeningRule Rules[] = {
    {"doc", nullptr, CheckWordCompoundFile},
    {"docx", IsWord12OrLater, CheckWordOpenXmlFile},
    {"xls", nullptr, CheckExcelCompoundFile},
    {"xlsx", IsExcel12OrLater, CheckExcelOpenXmlFile},
    {"ppt", nullptr, CheckPowerPointCompoundFile},
    {"pps", nullptr, CheckPowerPointCompoundFile},
    {"pptx", IsPowerPoint12OrLater, CheckPowerPointOpenXmlFile},
    {"ppsx", IsPowerPoint12OrLater, CheckPowerPointOpenXmlFile},
    {"pub", nullptr, CheckPublisherFile},
};

} // namespace

const ScreeningRule* FindScreeningRule(const wxString& extension) {
    for (const ScreeningRule& rule : Rules)
        if (extension.IsSameAs(rule.extension, false))
            return &rule;
    return nullptr;
}
