#include "tests/host/ConvertRun.h"
#include "tests/host/System.h"

namespace fs = std::filesystem;

namespace {

using nlohmann::json;

using ConvertTest = ConvertRun;

TEST_F(ConvertTest, DrivesTheFilterInItsOrderAndReportsTheOutput) {
    m_folder.Write("a.doc", "script");
    m_folder.Write("b.doc", "script");
    const std::string log = (m_folder / "log").string();
    const RunResult run = Convert({"a.doc", "b.doc"}, {"-j", "1", "--log", log});
    ASSERT_EQ(run.exitCode, 0) << run.err;
    const json document = run.Records("document").at(0);
    EXPECT_EQ(document["state"], "converted");
    EXPECT_EQ(document["output"], OutputPath("a.ps"));
    EXPECT_EQ(document["code"], 0);
    EXPECT_TRUE(document["seconds"].is_number());
    EXPECT_THAT(run.err, HasSubstr("a.doc: 50 %  Printing"));
    EXPECT_THAT(Output("a.ps"), HasSubstr("<ServerVersion>16</ServerVersion>"));

    const std::string records = ReadBytes(log);
    std::size_t at = 0;
    for (const char* call : {"InitializePlugin", "GetPluginInfo", "GetPluginInstance", "Initialize",
                             "ApplySettings", "Screen a.doc", "Convert a.doc", "Screen b.doc",
                             "Convert b.doc", "ReleasePluginInstance", "UninitializePlugin"}) {
        at = records.find(std::string("ScriptedFilter: ") + call + '\n', at);
        ASSERT_NE(at, std::string::npos) << call << '\n' << records;
    }
}

TEST_F(ConvertTest, EveryFailureKeepsItsCodeAndOneFolderStaysClean) {
    struct Case {
        std::string script;
        std::string state;
        int code;
        int exitCode;
    };
    const Case cases[] = {
        {"convert=1020", "failed", 1020, 1},
        {"convert=1021\noutput=none", "failed", 1021, 1},
        {"convert=1022", "failed", 1022, 1},
        {"convert=-1007", "failed", -1007, 1},
        {"convert=1012", "failed", 1012, 2},
        {"convert=-1006", "failed", -1006, 2},
        {"screen=-1005", "refused", -1005, 1},
        {"output=none", "failed", 1021, 1}, // success without an output is none
    };
    for (const Case& each : cases) {
        m_folder.Write("bad.doc", each.script);
        m_folder.Write("good.doc", "script");
        const RunResult run = Convert({"bad.doc", "good.doc"});
        EXPECT_EQ(run.exitCode, each.exitCode) << each.script;
        const std::vector<json> documents = run.Records("document");
        ASSERT_EQ(documents.size(), 2U) << run.err;
        EXPECT_EQ(documents[0]["state"], each.state) << each.script;
        EXPECT_EQ(documents[0]["code"], each.code) << each.script;
        EXPECT_TRUE(documents[0]["output"].is_null()) << each.script;
        EXPECT_EQ(documents[1]["state"], "converted") << each.script;
        EXPECT_EQ(Outputs(), Names{"good.ps"}) << each.script;
    }
}

TEST_F(ConvertTest, FontsThatAreNotThereAreToldOfTheDocumentThatAsksForThem) {
    m_folder.Write("a.docx", "PK\x03\x04\nfonts=Calibri>Carlito>metric;Futura>DejaVu Sans>");
    m_folder.Write("b.docx", "PK\x03\x04\n");
    // In a registry that workers share, the screening of the next document forgets what is told.
    for (int workers = 1; workers <= (System::ConvertsSideBySide ? 2 : 1); ++workers) {
        const RunResult run = Convert({"a.docx", "b.docx"}, {"-j" + std::to_string(workers)});
        const std::vector<nlohmann::json> documents = run.Records("document");
        EXPECT_EQ(documents.at(0)["fonts"].dump(),
                  R"([{"asked":"Calibri","sameMetrics":true,"used":"Carlito"},)"
                  R"({"asked":"Futura","sameMetrics":false,"used":"DejaVu Sans"}])");
        EXPECT_EQ(documents.at(1)["fonts"].dump(), "[]");
        EXPECT_THAT(run.err,
                    HasSubstr("fonts not installed: Calibri (set in Carlito, of the same widths), "
                              "Futura (set in DejaVu Sans)"));
    }
}

TEST_F(ConvertTest, AnOlderOutputStaysUntilThereIsAWholeNewOne) {
    fs::create_directory(Out());
    m_folder.Write("out/a.ps", "older");
    m_folder.Write("a.doc", "convert=1020");
    EXPECT_EQ(Convert({"a.doc"}).exitCode, 1);
    EXPECT_EQ(Output("a.ps"), "older");
    m_folder.Write("a.doc", "script");
    EXPECT_EQ(Convert({"a.doc"}).exitCode, 0);
    EXPECT_NE(Output("a.ps"), "older");
    EXPECT_EQ(Outputs(), Names{"a.ps"});
}

TEST_F(ConvertTest, AnOutputThatCannotBePutInPlaceIsAFailure) {
    fs::create_directories(m_folder / "out" / "a.ps");
    m_folder.Write("a.doc", "script");
    const RunResult run = Convert({"a.doc"});
    EXPECT_EQ(run.exitCode, 2);
    EXPECT_EQ(run.Records("document").at(0)["code"], -1003);
    EXPECT_EQ(Outputs(), Names{"a.ps"}) << "nothing beside the folder in the way";
}

TEST_F(ConvertTest, DocumentsOfOneNameAllGetAnOutput) {
    fs::create_directory(m_folder / "sub");
    for (const char* name : {"budget.doc", "budget.xls", "sub/budget.xls", "Budget.docx"})
        m_folder.Write(name, "companion=.log");
    m_folder.Write("budget.txt", "no filter's business, and so no claim to the name");
    const RunResult run =
        Convert({"budget.txt", "budget.doc", "budget.xls", "sub/budget.xls", "Budget.docx"});
    EXPECT_EQ(run.exitCode, 1) << "the text";
    EXPECT_EQ(run.Records("document").at(3)["output"], OutputPath("budget.xls (2).ps"));
    EXPECT_EQ(Outputs(), (Names{"Budget.docx.log", "Budget.docx.ps", "budget.log", "budget.ps",
                                "budget.xls (2).log", "budget.xls (2).ps", "budget.xls.log",
                                "budget.xls.ps"}));
}

TEST_F(ConvertTest, SettingsComeFromFileCommandLineAndDefaults) {
    m_folder.Write("a.doc", "script");
    const std::string printer = "PRINTER=Quillon PostScript File Printer\n";
    const std::string pdf = "OUTPUTFILETYPEPS=0\nOUTPUTFILETYPEPDF=1\n";
    const std::string ps = "OUTPUTFILETYPEPS=1\nOUTPUTFILETYPEPDF=0\n";
    const std::string profile = "SELECTEDDISTILLERPROFILE=Press.joboptions\n";
    const std::string across = "HANDOUTSHORIZONTAL=1\n";
    const std::string slides = "PRINTOUTPUTTYPE=Slides\n";
    const std::string colour = "COLOR=Color\n";
    const std::string page = "SLIDESPERPAGE=6\nHANDOUTSVERTICAL=0\nSCALETOFITPAGE=0\n"
                             "FRAMESLIDES=0\nPRINTHIDDENSLIDES=0\nPRINTCOMMENTSANDINKMARKUP=0\n";
    const std::string rest = across + slides + colour + page + "HIGHQUALITY=0\n";
    struct Case {
        std::string file;
        Arguments options;
        std::string told;
    };
    const Case cases[] = {
        {"<UI/>", {}, printer + pdf + rest},
        {"<UI/>", {"--ps"}, ps + printer + rest},
        {"<UI/>", {"--pdf", "--profile", "press"}, profile + pdf + printer + rest},
        {"<a><b><UI><PRINTER/><OUTPUTFILETYPEPS>1</OUTPUTFILETYPEPS></UI></b></a>",
         {},
         printer + ps + rest},
        {"<UI><OUTPUTFILETYPEPDF>0</OUTPUTFILETYPEPDF></UI>",
         {},
         "OUTPUTFILETYPEPDF=0\n" + printer + "OUTPUTFILETYPEPS=1\n" + rest},
        {"<UI><OUTPUTFILETYPEPS>1</OUTPUTFILETYPEPS><SELECTEDDISTILLERPROFILE>Gone"
         "</SELECTEDDISTILLERPROFILE></UI>", // no PDF file, and so no need of it
         {},
         "OUTPUTFILETYPEPS=1\nSELECTEDDISTILLERPROFILE=Gone\n" + printer + "OUTPUTFILETYPEPDF=0\n" +
             rest},
        {"<a><b><UI><COLOR>a</COLOR></UI></b><UI><COLOR>near</COLOR></UI></a>", // which filters
                                                                                // find
         {},
         "COLOR=near\n" + printer + pdf + across + slides + page + "HIGHQUALITY=0\n"},
        {"<UI><COLOR>one</COLOR><COLOR>two</COLOR><PRINTER>Nobody's</PRINTER></UI>",
         {"--set", "COLOR=Grau=\xC3\xA4", "--set", "HIGHQUALITY=1", "--set",
          "HIGHQUALITY=", "--printer", "Quillon PostScript File Printer"},
         "COLOR=Grau=\xC3\xA4\n" + printer + "HIGHQUALITY=0\n" + pdf + across + slides + page},
    };
    for (const Case& each : cases)
        for (const char* jobs : {"1", "2"}) { // in the process, or in one of its own
            Arguments options = {"--settings", m_folder.Write("s.xml", each.file).string(), "-j",
                                 jobs};
            options.insert(options.end(), each.options.begin(), each.options.end());
            const RunResult run = Convert({"a.doc"}, options);
            EXPECT_EQ(run.exitCode, 0) << run.err;
            const std::string output = Output("a.ps");
            EXPECT_EQ(output.substr(output.find("</ServerInformation>\n\n") + 22), each.told);
        }
}

TEST_F(ConvertTest, TheOutputFolderIsMadeAndMayBeWrittenAnyWay) {
    m_folder.Write("a.doc", "script");
    for (const std::string out :
         {"new", "slash/", "dots/../dots/.", "n\xC3\xA4h \xF0\x9F\x98\x80"}) {
        const RunResult run = RunQuillon({"convert", (m_folder / "a.doc").string(), "--out",
                                          m_folder.Path().string() + '/' + out});
        EXPECT_EQ(run.exitCode, 0) << run.err;
        EXPECT_TRUE(fs::is_regular_file(m_folder / fs::u8path(out) / "a.ps")) << out;
    }
}

TEST_F(ConvertTest, AnInterruptionFinishesTheDocumentAndReportsTheRest) {
    const std::string started = (m_folder / "started").string();
    m_folder.Write("a.doc", "started=" + started + "\nwait=" + (m_folder / "go").string());
    m_folder.Write("b.doc", "script");
    for (const auto ask : {&RunningProgram::Interrupt, &RunningProgram::Terminate}) {
        RunningProgram program(QuillonCommand(ArgumentsFor({"a.doc", "b.doc"}, {"-j", "1"})));
        AwaitFile(started);
        (program.*ask)();
        program.AwaitNote();
        m_folder.Write("go", "");
        const RunResult run = program.Wait();
        EXPECT_EQ(run.exitCode, 4) << run.err;
        EXPECT_EQ(run.Records("document").at(0)["state"], "converted");
        EXPECT_EQ(run.Records("document").at(1)["state"], "not converted");
        EXPECT_EQ(Outputs(), Names{"a.ps"});
        fs::remove(started);
        fs::remove(m_folder / "go");
    }
}

TEST_F(ConvertTest, ASecondInterruptionEndsTheProgramAndTheNextRunCleansUp) {
    const std::string started = (m_folder / "started").string();
    m_folder.Write("a.doc", "started=" + started + "\nwait=" + (m_folder / "never").string());
    RunningProgram program(QuillonCommand(ArgumentsFor({"a.doc"})));
    AwaitFile(started);
    program.InterruptTwice();
    EXPECT_TRUE(program.Wait().Records("summary").empty()) << "ended by one of the two";
    EXPECT_EQ(Outputs().size(), 1U) << "the hidden folder only";
    m_folder.Write("b.doc", "script");
    EXPECT_EQ(Convert({"b.doc"}).exitCode, 0);
    EXPECT_EQ(Outputs(), Names{"b.ps"});
}

TEST_F(ConvertTest, RunsIntoOneFolderLeaveEachOthersWorkAlone) {
    const std::string started = (m_folder / "started").string();
    m_folder.Write("a.doc", "started=" + started + "\nwait=" + (m_folder / "go").string());
    m_folder.Write("b.doc", "script");
    RunningProgram program(QuillonCommand(ArgumentsFor({"a.doc"})));
    AwaitFile(started);
    RunningProgram other(QuillonCommand(ArgumentsFor({"b.doc"})));
    if (!System::ConvertsSideBySide) // its turn comes after the first
        m_folder.Write("go", "");
    EXPECT_EQ(other.Wait().exitCode, 0);
    m_folder.Write("go", "");
    EXPECT_EQ(program.Wait().exitCode, 0);
    EXPECT_EQ(Outputs(), (Names{"a.ps", "b.ps"}));
}

} // namespace
