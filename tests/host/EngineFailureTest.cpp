#include "tests/host/ConvertRun.h"

namespace {

using nlohmann::json;

/// What an engine has left to say when the filter answers with a code alone.
class EngineFailureTest : public ConvertRun {
protected:
    struct Case {
        std::string script;
        std::string state;
        int code;
        json fault;
        std::string reason; ///< the end of it
    };

    /// @param command "screen" or "convert", and its options
    void Expect(const Case& each, const Arguments& command) const {
        Arguments arguments = ArgumentsFor({"a.docx", "b.docx"}, command);
        if (command.front() == "screen")
            arguments = {"screen", "--json", (m_folder / "a.docx").u8string(),
                         (m_folder / "b.docx").u8string()};
        m_folder.Write("a.docx", "PK\x03\x04\n" + each.script);
        m_folder.Write("b.docx", "PK\x03\x04\nscreen=-1005"); // without a word of its engine
        std::filesystem::remove(m_folder / "tried");
        const RunResult run = RunQuillon(arguments);
        const json document = run.Records("document").at(0);
        const auto reason = document["reason"].get<std::string>();
        EXPECT_EQ(document["state"], each.state) << document;
        EXPECT_EQ(document["code"], each.code) << document;
        EXPECT_EQ(document["fault"], each.fault) << document;
        EXPECT_EQ(reason.substr(reason.size() - std::min(reason.size(), each.reason.size())),
                  each.reason);
        EXPECT_EQ(run.exitCode, each.fault == "machine" ? 2 : 1) << run.err;
        EXPECT_EQ(run.Records("document").at(1)["fault"], "document") << "an earlier word of it";
    }

    std::string Once() const { return "\nonce=" + (m_folder / "tried").u8string(); }
};

const std::string FromOutside = "\nfault=outside\nreason=it was ended";
const std::string Twice = "it was ended, at the second try too";

TEST_F(EngineFailureTest, OfScreeningIsToldAndTriedOnceMoreWhenItCameFromOutside) {
    const Case cases[] = {
        {"screen=-1005\nfault=document\nreason=it is damaged", "refused", -1005, "document",
         "its application could not open it: it is damaged"},
        {"screen=-1005\nfault=machine\nreason=no room", "failed", -1003, "machine", "no room"},
        {"screen=-1005" + FromOutside, "failed", -1003, "machine", Twice},
        {"screen=-1005" + FromOutside + Once(), "accepted", 0, nullptr, ""},
    };
    for (const Case& each : cases)
        Expect(each, {"screen"});
}

TEST_F(EngineFailureTest, OfAConversionIsToldAndTriedOnceMoreWhenItCameFromOutside) {
    const Case cases[] = {
        {"convert=1020\nfault=document\nreason=it crashes", "failed", 1020, "document",
         "it crashes"},
        {"convert=-1007\nfault=machine\nreason=no room", "failed", -1007, "machine", "no room"},
        {"convert=1020" + FromOutside, "failed", 1020, "machine", Twice},
        {"convert=-1007" + FromOutside + Once(), "converted", 0, nullptr, ""},
        {"screen=-1005" + FromOutside + Once(), "converted", 0, nullptr, ""},
    };
    for (const Case& each : cases)
        for (const char* jobs : {"1", "2"})
            Expect(each, {"-j", jobs});
}

TEST_F(EngineFailureTest, IsToldInTheLanguageThatIsAskedFor) {
    const std::string prefix = "convert=1020\nfault=";
    const Case cases[] = {
        {prefix + "document\nreason=LibreOffice's supervisor stopped responding", "failed", 1020,
         "document", "der Aufsichtsprozess von LibreOffice antwortete nicht mehr"},
        {prefix + "machine\nreason=LibreOffice took longer than 9 seconds; only 20 files may be "
                  "open (ulimit -n)",
         "failed", 1020, "machine",
         "LibreOffice brauchte mehr als 9 Sekunden; nur 20 Dateien dürfen offen sein (ulimit -n)"},
        {prefix + "outside\nreason=LibreOffice was ended from outside (signal 9, Killed)", "failed",
         1020, "machine",
         "LibreOffice wurde von außen beendet (Signal 9, Killed), auch beim zweiten Versuch"},
        {prefix + "document\nreason=no word of ours", "failed", 1020, "document",
         "no word of ours"},
    };
    for (const Case& each : cases)
        for (const char* jobs : {"1", "2"})
            Expect(each, {"-j", jobs, "--lang", "de"});
}

} // namespace
