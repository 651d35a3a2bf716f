#include "tests/host/Program.h"
#include "tests/host/System.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/utils.h>

#include <gtest/gtest.h>

namespace {

using nlohmann::json;

bool Contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

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
    EXPECT_TRUE(Contains(applications[2]["advice"], System::PowerPointAdvice));

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
    EXPECT_TRUE(Contains(run.err, "Ready to convert doc docx xls xlsx.")) << run.err;
    EXPECT_EQ(run.Records("summary").at(0)["convertible"], (json{"doc", "docx", "xls", "xlsx"}));
}

TEST(Status, HandsTheLimitsToTheEnginesAndTheFilters) {
    const RunResult run = RunQuillon(
        {"status", "--engine-stall", "5", "--engine-limit", "60", "--memory-limit", "512"});
    EXPECT_TRUE(Contains(run.out, "Scripted engine, 5 of 60 s, 512 MB, output 5 of 60 s"))
        << run.out;
    EXPECT_TRUE(Contains(RunQuillon({"status"}).out,
                         "Scripted engine, 0 of 0 s, 3584 MB, output 0 of 0 s"));
}

TEST(Status, TellsWhatDocumentsAreNotKeptFrom) {
    EXPECT_TRUE(
        Contains(RunQuillon({"status", "--require-isolation"}).out, "full (Scripted walls)"));
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
    EXPECT_TRUE(Contains(status.out, "incomplete: " + gap)) << status.out;
    EXPECT_EQ(warned.exitCode, 0) << warned.err;
    EXPECT_TRUE(Contains(warned.err, "WARN") && Contains(warned.err, gap)) << warned.err;
    EXPECT_EQ(refused.exitCode, 2);
    EXPECT_TRUE(Contains(refused.err, gap) && Contains(refused.err, "or without --require"))
        << refused.err;
    EXPECT_EQ(refused.out, "");
    EXPECT_EQ(incomplete.exitCode, 2);
    EXPECT_TRUE(Contains(incomplete.out, "Es fehlt: Dokumente sind nicht von Netzwerk"))
        << incomplete.out;
}

TEST(Status, TellsWhatIsMissingAndWhatToDo) {
    const TemporaryFolder empty;
    const std::string folder = empty.Path().u8string();
    UnregisterStandIn(); // where a registry outlives the process, it is there from another test
    const RunResult noOffice =
        RunProgram({QUILLON_PROGRAM, "status", "--filters", TEST_FILTERS, "--stand-ins", folder});
    EXPECT_EQ(noOffice.exitCode, 2);
    EXPECT_TRUE(Contains(noOffice.out, "No Office application is installed")) << noOffice.out;
    EXPECT_TRUE(Contains(noOffice.out, System::OfficeAdvice)) << noOffice.out;
    EXPECT_TRUE(Contains(noOffice.out, "disabled: no Office application is installed"));
    EXPECT_TRUE(Contains(noOffice.out, "ask for PostScript with --ps")) << noOffice.out;

    const RunResult noFilter =
        RunProgram({QUILLON_PROGRAM, "status", "--filters", folder, "--stand-ins", TEST_STAND_INS});
    EXPECT_EQ(noFilter.exitCode, 2);
    EXPECT_TRUE(Contains(noFilter.out, "There is no filter")) << noFilter.out;
}

TEST(Status, TakesTheFiltersWordForIt) {
    wxSetEnv("SCRIPTED_FILTER_UNREADY", "1");
    const RunResult run = RunQuillon({"status"});
    wxUnsetEnv("SCRIPTED_FILTER_UNREADY");
    EXPECT_EQ(run.exitCode, 2);
    EXPECT_TRUE(Contains(run.out, "not ready, text of -1006")) << run.out;
    EXPECT_TRUE(Contains(run.out, "Missing: The filter Scripted is not ready")) << run.out;
    EXPECT_FALSE(Contains(run.out, "Ready to convert")) << run.out;
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
    EXPECT_TRUE(Contains(records, "INFO ") && Contains(records, "Other" + suffix)) << records;
    EXPECT_TRUE(Contains(records, "WARN ") && Contains(records, "Broken" + suffix)) << records;
    EXPECT_FALSE(Contains(records, "readme.txt")) << records;
}

} // namespace
