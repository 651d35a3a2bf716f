#include "tests/host/Program.h"
#include "tests/host/System.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/utils.h>

#include <gmock/gmock.h>

namespace {

using nlohmann::json;
using testing::AllOf;
using testing::Not;

TEST(Status, TellsWhatThereIs) {
    const RunResult run = RunQuillon({"status", "--json"});
    EXPECT_EQ(run.exitCode, 0) << run.err;
    ASSERT_EQ(run.Records("filter").size(), 1U) << run.out << run.err;
    const json filter = run.Records("filter")[0];
    EXPECT_EQ(filter["identifier"], "Scripted");
    EXPECT_EQ(filter["version"], "7.0");
    EXPECT_EQ(filter["extensions"], (json{"doc", "docx", "xls", "xlsx", "pub"}));
    EXPECT_EQ(filter["ready"], true);
    EXPECT_EQ(filter["text"], "");

    const std::vector<json> applications = run.Records("application");
    ASSERT_EQ(applications.size(), 4U);
    EXPECT_EQ(applications[0]["name"], "Word");
    EXPECT_EQ(applications[0]["version"], "16");
    EXPECT_EQ(applications[0]["usable"], true);
    EXPECT_EQ(applications[2]["installed"], false);
    EXPECT_THAT(applications[2]["advice"].get<std::string>(), HasSubstr(System::PowerPointAdvice));

    std::vector<json> preferred;
    for (const json& printer : run.Records("printer"))
        if (printer["preferred"] == true)
            preferred.push_back(printer);
    ASSERT_EQ(preferred.size(), 1U) << run.out;
    EXPECT_EQ(preferred[0]["postScript"], true);
    EXPECT_EQ(run.Records("distiller").at(0)["engine"], "Scripted Distiller");
    EXPECT_EQ(run.Records("distiller").at(0)["profiles"], json{"Press.joboptions"});
    EXPECT_EQ(run.Records("panel").at(0)["enabled"], true);
    EXPECT_TRUE(run.Records("missing").empty()) << run.out;
    EXPECT_THAT(run.err, HasSubstr("Ready to convert doc docx xls xlsx."));
    EXPECT_EQ(run.Records("summary").at(0)["convertible"], (json{"doc", "docx", "xls", "xlsx"}));
}

TEST(Status, HandsTheLimitsToTheEnginesAndTheFilters) {
    const RunResult run = RunQuillon(
        {"status", "--engine-stall", "5", "--engine-limit", "60", "--memory-limit", "512"});
    EXPECT_THAT(run.out, HasSubstr("Scripted engine, 5 of 60 s, 512 MB, output 5 of 60 s"));
    EXPECT_THAT(RunQuillon({"status"}).out,
                HasSubstr("Scripted engine, 0 of 0 s, 3584 MB, output 0 of 0 s"));
}

TEST(Status, TellsWhatDocumentsAreNotKeptFrom) {
    EXPECT_THAT(RunQuillon({"status", "--require-isolation"}).out,
                HasSubstr("full (Scripted walls)"));
    const TemporaryFolder folder;
    const std::string document = folder.Write("letter.docx", "PK\x03\x04\n").u8string();
    const std::string gap = "network and processes are not kept from documents";
    const std::vector<std::string> convert = {"convert", document, "--out", document + ".out"};
    wxSetEnv("SCRIPTED_GAP", gap);
    const RunResult status = RunQuillon({"status"});
    const RunResult warned = RunQuillon(convert);
    std::vector<std::string> requiring = convert;
    requiring.emplace_back("--require-isolation");
    const RunResult refused = RunQuillon(requiring);
    const RunResult incomplete = RunQuillon({"status", "--require-isolation", "--lang", "de"});
    wxUnsetEnv("SCRIPTED_GAP");

    EXPECT_EQ(status.exitCode, 0) << status.out;
    EXPECT_THAT(status.out, HasSubstr("incomplete: " + gap));
    EXPECT_EQ(warned.exitCode, 0) << warned.err;
    EXPECT_THAT(warned.err, AllOf(HasSubstr("WARN"), HasSubstr(gap)));
    EXPECT_EQ(refused.exitCode, 2);
    EXPECT_THAT(refused.err, AllOf(HasSubstr(gap), HasSubstr("or without --require")));
    EXPECT_EQ(refused.out, "");
    EXPECT_EQ(incomplete.exitCode, 2);
    EXPECT_THAT(incomplete.out, HasSubstr("Es fehlt: Dokumente sind nicht von Netzwerk"));
}

TEST(Status, TellsWhatIsMissingAndWhatToDo) {
    const TemporaryFolder empty;
    const std::string folder = empty.Path().u8string();
    UnregisterStandIn(); // where a registry outlives the process, it is there from another test
    const RunResult noOffice =
        RunProgram({QUILLON_PROGRAM, "status", "--filters", TEST_FILTERS, "--stand-ins", folder});
    EXPECT_EQ(noOffice.exitCode, 2);
    EXPECT_THAT(noOffice.out, HasSubstr("No Office application is installed"));
    EXPECT_THAT(noOffice.out, HasSubstr(System::OfficeAdvice));
    EXPECT_THAT(noOffice.out, HasSubstr("disabled: no Office application is installed"));
    EXPECT_THAT(noOffice.out, HasSubstr("ask for PostScript with --ps"));

    const RunResult noFilter =
        RunProgram({QUILLON_PROGRAM, "status", "--filters", folder, "--stand-ins", TEST_STAND_INS});
    EXPECT_EQ(noFilter.exitCode, 2);
    EXPECT_THAT(noFilter.out, HasSubstr("There is no filter"));
}

TEST(Status, TakesTheFiltersWordForIt) {
    wxSetEnv("SCRIPTED_FILTER_UNREADY", "1");
    const RunResult run = RunQuillon({"status"});
    wxUnsetEnv("SCRIPTED_FILTER_UNREADY");
    EXPECT_EQ(run.exitCode, 2);
    EXPECT_THAT(run.out, HasSubstr("not ready, text of -1006"));
    EXPECT_THAT(run.out, HasSubstr("Missing: The filter Scripted is not ready"));
    EXPECT_THAT(run.out, Not(HasSubstr("Ready to convert")));
}

TEST(Status, PassesOverWhatIsNoFilter) {
    const TemporaryFolder folder;
    const std::string suffix = System::ModuleSuffix;
    std::filesystem::copy_file(std::filesystem::path(TEST_MODULES) / ("NoFilter" + suffix),
                               folder / ("Other" + suffix));
    folder.Write("Broken" + suffix, "no module");
    folder.Write("readme.txt", "");
    const std::string log = (folder / "log").u8string();
    const RunResult run =
        RunProgram({QUILLON_PROGRAM, "status", "--filters", folder.Path().u8string(), "--stand-ins",
                    TEST_STAND_INS, "--log", log});
    EXPECT_EQ(run.exitCode, 2);
    const std::string records = ReadBytes(log);
    EXPECT_THAT(records, AllOf(HasSubstr("INFO "), HasSubstr("Other" + suffix)));
    EXPECT_THAT(records, AllOf(HasSubstr("WARN "), HasSubstr("Broken" + suffix)));
    EXPECT_THAT(records, Not(HasSubstr("readme.txt")));
}

} // namespace
