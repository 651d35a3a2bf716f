#include "office/OpenXmlCheck.h"

#include "plugin/ResultCodes.h"
#include "tests/support/RecordingOffice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;

struct TrialOpen {
    const wchar_t* progId;
    int (*check)(const wxString&);
    const char* collection;
    DISPID open;
    std::vector<std::string> calls;
};

const TrialOpen TrialOpens[] = {
    {L"Word.Application",
     CheckWordOpenXmlFile,
     "Documents",
     15,
     {"Word.6 get", "Documents.14 method (&omitted, &omitted, &omitted, &omitted)",
      "Documents.15 method (&\"/in/a b.docx\", &omitted, &I2 1, &omitted, &omitted, &omitted, "
      "&omitted, &omitted, &omitted, &omitted, &omitted, &omitted)",
      "~AddedDocument", "Document.1105 method (&I2 0, &omitted, &omitted)",
      "Word.1105 method (&I2 0, &omitted, &omitted)", "~Document", "~Documents", "~Word"}},
    {L"Excel.Application",
     CheckExcelOpenXmlFile,
     "Workbooks",
     682,
     {"Excel.572 get",
      "Workbooks.682 method (\"/in/a b.docx\", omitted, I2 1, omitted, omitted, omitted, omitted, "
      "omitted, omitted, omitted, omitted, omitted, omitted)",
      "Workbook.277 method (I2 0, omitted, omitted)", "Excel.302 method", "~Workbook", "~Workbooks",
      "~Excel"}},
    {L"PowerPoint.Application",
     CheckPowerPointOpenXmlFile,
     "Presentations",
     2004,
     {"PowerPoint.2001 get", "Presentations.2004 method (\"/in/a b.docx\", I4 1, I4 1, I4 0)",
      "Presentation.2039 method", "PowerPoint.2021 method", "~Presentation", "~Presentations",
      "~PowerPoint"}},
};

TEST(OpenXmlCheck, OpensClosesAndQuits) {
    for (const TrialOpen& trial : TrialOpens) {
        RecordingOffice office({trial.progId});
        EXPECT_EQ(Result::Success, trial.check("/in/a b.docx"));
        EXPECT_EQ(trial.calls, office.Journal());
    }
}

TEST(OpenXmlCheck, OnlyReleasesAnApplicationThatRefusesTheDocument) {
    for (const TrialOpen& trial : TrialOpens) {
        RecordingOffice office({trial.progId});
        office.On(trial.collection, trial.open,
                  [](const auto&) { throw RecordingOffice::Raise{L"cannot open"}; });
        EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a.docx"));

        const std::string collection = trial.collection;
        const std::vector<std::string> calls = office.JournalInShort();
        const auto open =
            std::find(calls.begin(), calls.end(), collection + "." + std::to_string(trial.open));
        ASSERT_NE(calls.end(), open);
        for (auto after = open + 1; after != calls.end(); ++after)
            EXPECT_EQ('~', after->front()) << *after; // nothing but releases
        EXPECT_EQ(0U, office.LiveObjects());
    }
}

TEST(OpenXmlCheck, RefusesWhereTheApplicationCannotBeStarted) {
    for (const TrialOpen& trial : TrialOpens) {
        EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a.docx")); // not installed
        RecordingOffice office({trial.progId});
        office.RefuseToStart();
        EXPECT_EQ(Result::InvalidInputFile, trial.check("/in/a.docx"));
        EXPECT_EQ(Result::InputFileNotFound, trial.check(wxString()));
        EXPECT_THAT(office.Journal(), ElementsAre());
    }
}

} // namespace
