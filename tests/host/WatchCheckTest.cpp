#include "tests/host/Program.h"

#include <functional>

namespace fs = std::filesystem;

namespace {

class WatchCheckTest : public testing::Test {
protected:
    void SetUp() override {
        fs::create_directories(m_folder / "in");
        fs::create_directories(m_folder / "kept");
    }

    /// @param more of the folder
    RunResult Check(const std::string& more, const std::string& http = {}) const {
        const fs::path file =
            m_folder.Write("watch.toml", "journal = \"kept/journal.db\"\nhttp = \"" + http +
                                             "\"\n[[folder]]\n"
                                             "in = \"in\"\nout = \"out\"\n" +
                                             more);
        return RunQuillon({"watch", "--config", file.u8string(), "--check", "--json"});
    }

    TemporaryFolder m_folder;
};

TEST_F(WatchCheckTest, SaysWhatWouldBeDoneAndDoesNothing) {
    const RunResult run = Check("settle = \"500ms\"\nset = { SLIDESPERPAGE = 6 }\n");
    EXPECT_EQ(run.exitCode, 0) << run.err;
    EXPECT_THAT(run.Records("problem"), testing::IsEmpty());
    ASSERT_EQ(run.Records("folder").size(), 1U);
    const nlohmann::json folder = run.Records("folder")[0];
    EXPECT_EQ(fs::u8path(folder["in"].get<std::string>()), m_folder / "in");
    EXPECT_EQ(folder["set"], nlohmann::json({"SLIDESPERPAGE=6"}));
    EXPECT_EQ(folder["settle"], 0.5);
    EXPECT_EQ(folder["sight"]["share"], false);
    EXPECT_EQ(folder["sight"]["events"], true);
    EXPECT_NE(folder["sight"]["writers"], "none");
    EXPECT_THAT(run.err, HasSubstr("500ms"));
    EXPECT_TRUE(fs::is_empty(m_folder / "in") && fs::is_empty(m_folder / "kept"));
    EXPECT_FALSE(fs::exists(m_folder / "out"));
}

TEST_F(WatchCheckTest, SaysThatThePageCannotBeShown) {
    const RunResult run = Check({}, "192.0.2.1:9188"); // nobody's
    EXPECT_EQ(run.exitCode, 3);
    ASSERT_EQ(run.Records("problem").size(), 1U) << run.out;
    EXPECT_THAT(run.Records("problem")[0]["text"].get<std::string>(), HasSubstr("192.0.2.1:9188"));
}

TEST_F(WatchCheckTest, WithoutAFilterThereIsNoWatch) {
    const std::string empty = (m_folder / "kept").u8string();
    const RunResult run =
        RunProgram({QUILLON_PROGRAM, "watch", (m_folder / "in").u8string(), "--out",
                    (m_folder / "out").u8string(), "--once", "--filters", empty});
    EXPECT_EQ(run.exitCode, 2);
    EXPECT_THAT(run.err, HasSubstr("no filter could be loaded"));
}

TEST_F(WatchCheckTest, SaysWhatIsInTheWay) {
    const auto make = [this](const char* name) { m_folder.Write(name, "something else"); };
    const struct {
        std::function<void()> harm;
        const char* made; ///< which goes again
        const char* more;
        const char* reason;
    } cases[] = {
        {[&] { make("in/failed"); }, "in/failed", "", "nothing can be put into"},
        {[&] { make("out"); }, "out", "", "it is a file, not a folder"},
        {[&] { make("kept/journal.db"); }, "kept/journal.db", "", "is damaged, or is none"},
        {[] {}, "", "settings = \"none.xml\"\n", "no such file"},
        {[] {}, "", "set = { PRINTER = \"Nobody's\" }\n", "no printer \"Nobody's\""},
        {[] {}, "", "[defaults]\nmin_free = \"1000T\"\n", "no space in"},
        {[this] { fs::remove_all(m_folder / "in"); }, "", "", "cannot be seen"},
    };
    for (const auto& [harm, made, more, reason] : cases) {
        harm();
        const RunResult run = Check(more);
        if (*made)
            fs::remove(m_folder / made);
        EXPECT_EQ(run.exitCode, 3) << reason;
        ASSERT_EQ(run.Records("problem").size(), 1U) << run.out;
        EXPECT_THAT(run.Records("problem")[0]["text"].get<std::string>(), HasSubstr(reason));
    }
}

} // namespace
