#include "office/OpenXmlCheck.h"

#include "plugin/interface/ResultCodes.h"
#include "tests/filter/JournalCalls.h"

#include <gtest/gtest.h>

namespace {

const struct TrialOpen {
    const wchar_t* progId;
    int (*check)(const wxString&);
    std::vector<std::string> calls;
} TrialOpens[] = {
    {L"Word.Application",
     CheckWordOpenXmlFile,
     {"Word.6 get", "Documents.14 method (&omitted, &omitted, &omitted, &omitted)",
      "Documents.15 method (&\"/in/a b.docx\", &omitted, &I2 1, &omitted, &omitted, &omitted, "
      "&omitted, &omitted, &omitted, &omitted, &omitted, &omitted)",
      "~AddedDocument", "Document.1105 method (&I2 0, &omitted, &omitted)",
      "Word.1105 method (&I2 0, &omitted, &omitted)", "~Document", "~Documents", "~Word"}},
    {L"Excel.Application",
     CheckExcelOpenXmlFile,
     {"Excel.572 get",
      "Workbooks.682 method (\"/in/a b.docx\", omitted, I2 1, omitted, omitted, omitted, omitted, "
      "omitted, omitted, omitted, omitted, omitted, omitted)",
      "Workbook.277 method (I2 0, omitted, omitted)", "Excel.302 method", "~Workbook", "~Workbooks",
      "~Excel"}},
    {L"PowerPoint.Application",
     CheckPowerPointOpenXmlFile,
     {"PowerPoint.2001 get", "Presentations.2004 method (\"/in/a b.docx\", I4 1, I4 1, I4 0)",
      "Presentation.2039 method", "PowerPoint.2021 method", "~Presentation", "~Presentations",
      "~PowerPoint"}},
};

TEST(OpenXmlCheck, OpensClosesAndQuits) {
    for (const TrialOpen& trial : TrialOpens) {
        const RecordingOffice office({trial.progId});
        EXPECT_EQ(Result::Success, trial.check("/in/a b.docx"));
        EXPECT_EQ(trial.calls, office.Journal());
    }
}

TEST(OpenXmlCheck, OnlyReleasesAnApplicationThatFailsACall) {
    for (const TrialOpen& trial : TrialOpens) {
        const std::vector<std::string> calls = WithoutReleases(trial.calls);
        for (auto call = calls.begin(); call != calls.end(); ++call) {
            RecordingOffice office({trial.progId});
            FailAt(office, *call, Raise);
            EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a b.docx"));
            EXPECT_EQ(std::vector(calls.begin(), call + 1), WithoutReleases(office.Journal()));
            EXPECT_EQ(0U, office.LiveObjects());
        }
    }
}

TEST(OpenXmlCheck, RefusesWhereTheApplicationCannotBeStarted) {
    for (const TrialOpen& trial : TrialOpens) {
        EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a.docx")); // not installed
        RecordingOffice office({trial.progId});
        office.OnStart(DenyAccess);
        EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a.docx"));
        EXPECT_EQ(Result::InputFileNotFound, trial.check(wxString()));
        EXPECT_TRUE(office.Journal().empty());
    }
}

} // namespace
