// What is made of the words with which a print server calls for a conversion.

#include "host/program/printserver/DocumentTypes.h"
#include "host/program/printserver/JobSettings.h"
#include "tests/host/Program.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Matcher;

namespace {

TEST(SpoolerJobTest, ADocumentIsCalledByItsTitleAndItsType) {
    const std::string presentation = "application/vnd.ms-powerpoint";
    const struct {
        std::string title;
        std::string type;
        const char* name;
    } rows[] = {
        {"letter.doc", "application/msword", "letter.doc"},
        {"LETTER.DOC", "application/msword", "LETTER.DOC"},
        {"Report 1.2", "application/msword", "Report 1.2.doc"},
        {"show.pps", presentation, "show.pps"},
        {"(stdin)", presentation, "(stdin).ppt"},
        {"letter.doc", presentation, "letter.doc.ppt"},
        {"letter.xls", "application/octet-stream", "letter.xls"},
        {"letter", "", "letter"},
        {"C:\\Documents\\letter.doc", "", "letter.doc"},
        {"../../etc/passwd", "application/msword", "passwd.doc"},
        {"..", "application/msword", "document.doc"},
        {"~$letter.doc", "", "$letter.doc"},
        {"", "application/msword", "document.doc"},
        {"a\nb*\x7F?.doc", "", "a_b___.doc"},
        {"B\xFCro.doc", "", "Büro.doc"},
        {std::string(5000, 'x') + ".doc", "", nullptr},
    };
    for (const auto& row : rows) {
        const std::string expected = row.name ? row.name : std::string(60, 'x') + ".doc";
        EXPECT_EQ(DocumentName(row.title, row.type).utf8_string(), expected);
    }
}

TEST(SpoolerJobTest, OptionsAreTakenForSettingsWhereTheyAreAny) {
    const std::string large(100'000, 'x');
    const struct {
        JobOptions options;
        Matcher<const std::vector<std::string>&> settings;
    } rows[] = {
        {{{"media", "A4"}, {"copies", "99999"}, {large, large}, {"", ""}}, IsEmpty()},
        {{{"Handouts", "6"}}, ElementsAre("PRINTOUTPUTTYPE=Handouts", "SLIDESPERPAGE=6")},
        {{{"frame-slides", "true"}, {"PrintHiddenSlides", "no"}},
         ElementsAre("PRINTHIDDENSLIDES=0", "FRAMESLIDES=1")},
        {{{"printoutputtype", "notes-pages"}}, ElementsAre("PRINTOUTPUTTYPE=Notes Pages")},
        {{{"print-color-mode", "monochrome"}}, ElementsAre("COLOR=Grayscale")},
        {{{"print-color-mode", "bi-level"}, {"color", "Color"}},
         ElementsAre("COLOR=Pure Black and White", "COLOR=Color")},
        {{{"print-color-mode", "auto"}}, IsEmpty()},
        {{{"OutputFileTypePdf", "1"}, {"printer", "another"}}, IsEmpty()}, // not the job's to say
        {{{"HighQuality", "Draft"}}, IsEmpty()},                           // the printer's
    };
    Fault fault;
    for (const auto& row : rows) {
        const auto settings = SettingsOfJob(row.options, {"HIGHQUALITY"}, fault);
        ASSERT_TRUE(settings) << fault.Text();
        EXPECT_THAT(*settings, row.settings);
    }
    for (const auto& [name, value] : JobOptions{{"Handouts", "7"}, {"frame-slides", large}}) {
        EXPECT_FALSE(SettingsOfJob({{name, value}}, {}, fault));
        EXPECT_THAT(fault.Text().utf8_string(), HasSubstr("the option " + name + " cannot be"));
        EXPECT_LT(fault.Text().length(), 200U);
    }
}

} // namespace
