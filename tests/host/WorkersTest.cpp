#include "tests/host/ConvertRun.h"
#include "tests/host/System.h"

namespace fs = std::filesystem;

namespace {

using nlohmann::json;

/// Documents converted side by side.
class WorkersTest : public ConvertRun {
protected:
    std::string Place(const std::string& name) const { return (m_folder / name).u8string(); }

    /// A document under way until the file `go` is there; it makes a file `name`.started.
    void WriteWaiting(const std::string& name) const {
        m_folder.Write(name, "started=" + Place(name + ".started") + "\nwait=" + Place("go"));
    }

    /// Waits until the documents a and b are under way, as far as they can be at one time.
    void AwaitStart() const {
        const auto isThere = [this](const char* name) { return fs::exists(Place(name)); };
        Await("the start of both", [&isThere] {
            const bool a = isThere("a.doc.started");
            const bool b = isThere("b.doc.started");
            return System::ConvertsSideBySide ? a && b : a || b;
        });
    }

    /// @param log the log file that the run was given
    static void ExpectNoneLeft(const std::string& log) {
        Await("the end of all workers", [&log] { return !IsQuillonRunningWith(log); });
    }
};

std::vector<std::string> States(const RunResult& run) {
    std::vector<std::string> states;
    for (const json& document : run.Records("document"))
        states.push_back(document["state"]);
    return states;
}

TEST_F(WorkersTest, OverlapAndAreToldInTheOrderOfTheFiles) {
    const std::string overlap = "wait=" + Place("d.started");
    m_folder.Write("a.doc", System::ConvertsSideBySide ? overlap : "script");
    m_folder.Write("b.doc", "screen=-1005");
    m_folder.Write("c.txt", "no filter's");
    m_folder.Write("d.doc", "started=" + Place("d.started"));
    const RunResult run = Convert({"a.doc", "b.doc", "c.txt", "d.doc", "none.doc"}, {"-j", "2"});
    EXPECT_EQ(run.exitCode, 1) << run.err;
    EXPECT_EQ(States(run), (Names{"converted", "refused", "refused", "converted", "refused"}));
    EXPECT_EQ(run.Records("document").at(3)["output"], OutputPath("d.ps"));
    EXPECT_EQ(run.Records("document").at(4)["code"], -1002);
    EXPECT_EQ(Outputs(), (Names{"a.ps", "d.ps"}));
}

TEST_F(WorkersTest, OneThatEndsOrStopsFailsItsDocumentOnly) {
    struct Case {
        const char* script;
        const char* reason;
    };
    const Case cases[] = {
        {"crash=1", "the process that converted it ended"},
        {"stop=1", "the process that converted it gave no sign of life"},
    };
    for (const Case& each : cases) {
        m_folder.Write("a.doc", "script");
        m_folder.Write("b.doc", each.script);
        for (const char* name : {"c.doc", "d.doc", "e.doc"})
            m_folder.Write(name, "script");
        const std::string log = Place("log");
        const RunResult run = Convert({"a.doc", "b.doc", "c.doc", "d.doc", "e.doc"},
                                      {"-j", "2", "--engine-stall", "5", "--log", log});
        EXPECT_EQ(run.exitCode, 1) << run.err;
        EXPECT_EQ(States(run),
                  (Names{"converted", "failed", "converted", "converted", "converted"}));
        const json failed = run.Records("document").at(1);
        EXPECT_EQ(failed["code"], -1003);
        EXPECT_THAT(failed["reason"].get<std::string>(), HasSubstr(each.reason)) << failed;
        EXPECT_EQ(Outputs(), (Names{"a.ps", "c.ps", "d.ps", "e.ps"}));
        ExpectNoneLeft(log);
    }
}

TEST_F(WorkersTest, OneThatSomebodyEndsHasItsDocumentTriedOnceMore) {
    m_folder.Write("a.doc", "end=1\nonce=" + Place("a.ended"));
    m_folder.Write("b.doc", "end=1");
    m_folder.Write("c.doc", "script");
    const RunResult run = Convert({"a.doc", "b.doc", "c.doc"}, {"-j", "2"});
    EXPECT_EQ(run.exitCode, 2) << run.err;
    EXPECT_EQ(States(run), (Names{"converted", "failed", "converted"}));
    const json failed = run.Records("document").at(1);
    EXPECT_EQ(failed["fault"], "machine");
    EXPECT_THAT(failed["reason"].get<std::string>(), HasSubstr("second try")) << failed;
    EXPECT_EQ(Outputs(), (Names{"a.ps", "c.ps"}));
}

TEST_F(WorkersTest, AnInterruptionFinishesWhatIsUnderWay) {
    for (const char* name : {"a.doc", "b.doc"})
        WriteWaiting(name);
    m_folder.Write("c.doc", "script");
    const std::string log = Place("log");
    RunningProgram program(
        QuillonCommand(ArgumentsFor({"a.doc", "b.doc", "c.doc"}, {"-j", "2", "--log", log})));
    AwaitStart();
    program.Interrupt();
    program.AwaitNote();
    m_folder.Write("go", "");
    const RunResult run = program.Wait();
    EXPECT_EQ(run.exitCode, 4) << run.err;
    EXPECT_EQ(States(run), (Names{"converted", "converted", "not converted"}));
    EXPECT_EQ(Outputs(), (Names{"a.ps", "b.ps"}));
    ExpectNoneLeft(log);
}

TEST_F(WorkersTest, EndWithTheRunThatTheyWorkFor) {
    WriteWaiting("a.doc");
    m_folder.Write("b.doc", "started=" + Place("b.doc.started") + "\nstop=1");
    const std::string log = Place("log");
    RunningProgram program(
        QuillonCommand(ArgumentsFor({"a.doc", "b.doc"}, {"-j", "2", "--log", log})));
    AwaitStart();
    program.InterruptTwice();
    EXPECT_TRUE(program.Wait().Records("summary").empty());
    ASSERT_NO_FATAL_FAILURE(ExpectNoneLeft(log)); // it would keep the next run waiting
    m_folder.Write("c.doc", "script");
    EXPECT_EQ(Convert({"c.doc"}).exitCode, 0);
    EXPECT_EQ(Outputs(), Names{"c.ps"}) << "what they left is gone";
}

} // namespace
