#include "host/program/base/PathText.h"
#include "host/program/page/PageServer.h"
#include "host/program/report/Texts.h"
#include "tests/host/FakeJournal.h"

#include <gmock/gmock.h>
#include <httplib.h>

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

namespace {

constexpr const char* Hostile = "<script>alert(1)\"&'.doc";

Job JobOf(std::int64_t id, JobState state, const char* name) {
    Job job;
    job.id = id;
    job.folder = "letters";
    job.source = std::filesystem::path("/in") / name;
    job.state = state;
    job.open = false;
    job.inserted = job.ended = std::chrono::system_clock::now();
    return job;
}

/// @param version of what it converts with; empty for none
Machine MachineOf(const char* name, const char* version) {
    Machine machine;
    machine.name = name;
    machine.makers = {version, "LibreOffice 7", "Ghostscript 10", "f0"};
    machine.isAlive = true;
    machine.started = machine.seen = std::chrono::system_clock::now();
    return machine;
}

/// A server on a watch that is well, with one folder.
class Page : public testing::Test {
protected:
    Page() {
        FolderStatus folder;
        folder.configuration.name = "letters";
        folder.reachable = true;
        folder.freeBytes = 4096;
        m_status.folders = {folder};
        m_status.lastPass = std::chrono::steady_clock::now();
        m_board.Put(m_status);
    }

    std::unique_ptr<PageServer> Start(const std::string& address, Fault& fault) {
        return PageServer::Start(
            address,
            [this](Fault& why) {
                why.what = "no journal";
                return m_hasJournal ? std::make_unique<FakeJournal>(m_journal) : nullptr;
            },
            m_board, [this] { ++m_requests; }, fault);
    }

    /// @return what the server says at once, which reads the journal anew
    httplib::Response Get(const std::string& path, const httplib::Headers& headers = {}) {
        Fault fault;
        m_server = nullptr;
        m_server = Start("127.0.0.1:0", fault);
        EXPECT_TRUE(m_server) << fault.what;
        const auto answer = Client().Get(path, headers);
        EXPECT_TRUE(answer) << path;
        return answer ? *answer : httplib::Response();
    }

    int Post(const std::string& path, const httplib::Params& form,
             const httplib::Headers& headers = {}) {
        const auto answer = Client().Post(path, headers, form);
        return answer ? answer->status : -1;
    }

    std::string Token() {
        const std::string before = "name=\"token\" value=\"";
        const std::string page = Get("/").body;
        return page.substr(page.find(before) + before.size(), 32);
    }

    FakeJournal::Content m_journal;
    bool m_hasJournal = true;
    StatusBoard m_board;
    WatchStatus m_status;
    std::atomic<int> m_requests{0};
    std::unique_ptr<PageServer> m_server;

private:
    httplib::Client Client() const { return httplib::Client("http://" + m_server->Address()); }
};

TEST_F(Page, ShowsWhatNamesAndReasonsSayAndRunsNothingOfThem) {
    Job failed = JobOf(7, JobState::Failed, Hostile);
    failed.fault = Fault{"<b>broken</b>", Blame::Document, 1013, "do <this>"};
    m_journal.jobs = {failed, JobOf(8, JobState::Archived, "good.doc")};
    m_status.running.resize(1);
    m_status.running[0].name = "</bdi><img src=x>";
    m_status.folders[0].obstacle = "<i>full</i>";
    m_board.Put(m_status);

    const httplib::Response page = Get("/");
    EXPECT_EQ(page.status, 200);
    for (const char* shown :
         {"&lt;script&gt;alert(1)&quot;&amp;&#39;.doc", "&lt;b&gt;broken", "do &lt;this&gt;",
          "&lt;/bdi&gt;&lt;img", "&lt;i&gt;full", "good.doc"})
        EXPECT_THAT(page.body, HasSubstr(shown));
    for (const char* markup : {"<script>", "<b>", "<this>", "<img", "<i>"})
        EXPECT_THAT(page.body, Not(HasSubstr(markup)));
    EXPECT_THAT(page.get_header_value("Content-Security-Policy"),
                AllOf(HasSubstr("default-src 'none'"), HasSubstr("frame-ancestors 'none'"),
                      Not(HasSubstr("unsafe"))));
    EXPECT_EQ(page.get_header_value_count("Content-Security-Policy"), 1U);
    EXPECT_EQ(page.get_header_value("Cache-Control"), "no-store");
}

TEST_F(Page, DoesWhatItsOwnFormsAskForAndNothingElse) {
    m_journal.jobs = {JobOf(7, JobState::Failed, "a.doc"), JobOf(8, JobState::Failed, "b.doc"),
                      JobOf(9, JobState::Failed, "c.doc")};
    m_journal.jobs[2].folder = "slides";
    const std::string token = Token();
    struct {
        const char* path;
        httplib::Params form;
        httplib::Headers headers;
        int status;
    } const cases[] = {
        {"/retry", {{"id", "7"}}, {}, 403},
        {"/retry", {{"id", "7"}, {"token", std::string(32, '0')}}, {}, 403},
        {"/retry", {{"id", "7"}, {"token", token.substr(0, 31)}}, {}, 403},
        {"/retry", {{"id", "7"}, {"token", token}}, {{"Origin", "http://other.example"}}, 403},
        {"/retry", {{"id", "7"}, {"token", token}}, {{"Sec-Fetch-Site", "cross-site"}}, 403},
        {"/retry", {{"id", "7"}, {"token", token}}, {{"Host", "other.example"}}, 421},
        {"/pause", {{"folder", "gone"}, {"token", token}}, {}, 404},
        {"/pause", {{"folder", std::string(9000, 'x')}, {"token", token}}, {}, 413},
    };
    for (const auto& [path, form, headers, status] : cases)
        EXPECT_EQ(Post(path, form, headers), status) << status;
    EXPECT_TRUE(m_journal.retried.empty());
    EXPECT_EQ(m_requests, 0);

    EXPECT_EQ(Post("/retry", {{"id", "8"}, {"token", token}},
                   {{"Origin", "http://" + m_server->Address()}}),
              303);
    EXPECT_EQ(Post("/retry", {{"all", "1"}, {"folder", "letters"}, {"token", token}}), 303);
    EXPECT_THAT(m_journal.retried, ElementsAre(8, 7));
    EXPECT_EQ(Post("/pause", {{"folder", "letters"}, {"token", token}}), 303);
    EXPECT_THAT(m_journal.paused, ElementsAre("letters"));
    EXPECT_EQ(Post("/resume", {{"folder", "letters"}, {"token", token}}), 303);
    EXPECT_TRUE(m_journal.paused.empty());
    EXPECT_EQ(m_requests, 4);
}

TEST_F(Page, TellsWhatIsNotWell) {
    const WatchStatus well = m_status;
    EXPECT_EQ(Get("/healthz").body, "ok\n");
    const struct {
        std::function<void()> harm;
        const char* reason;
    } cases[] = {
        {[this] { m_status.lastPass -= std::chrono::seconds(11); },
         "the folders were last looked at 11 s ago\n"},
        {[this] { m_status.lastPass = {}; }, "the folders have not been looked at yet\n"},
        {[this] { m_status.journalFault = "disk I/O error"; }, "disk I/O error\n"},
        {[this] { m_journal.fault = "locked"; }, "the journal cannot be used: locked\n"},
        {[this] { m_status.draining = true; }, "is ending"},
        {[this] { m_journal.paused = {""}; }, "all folders are paused\n"},
        {[this] { m_journal.paused = {"letters"}; }, "folder letters is paused\n"},
        {[this] { m_status.folders[0].reachable = false; }, "folder letters cannot be reached\n"},
        {[this] { m_status.folders[0].obstacle = "no space"; }, "folder letters: no space\n"},
        {[this] { m_journal.machines = {MachineOf("finder:1", "")}; }, "no machine converts"},
        {[this] {
             m_journal.machines = {MachineOf("gone:1", "2.0")};
             m_journal.machines->front().isAlive = false;
         },
         "no machine converts"},
        {[this] { m_hasJournal = false; }, "no journal\n"},
    };
    for (const auto& [harm, reason] : cases) {
        m_status = well;
        m_journal = {};
        harm();
        m_board.Put(m_status);
        const httplib::Response answer = Get("/healthz");
        EXPECT_EQ(answer.status, 503) << reason;
        EXPECT_THAT(answer.body, HasSubstr(reason));
        EXPECT_EQ(Get("/").status, 200) << reason;
    }
    m_journal = {};
    EXPECT_THAT(Get("/healthz?json").body, HasSubstr(R"({"ok":false,"reasons":[")"));
}

TEST_F(Page, GivesFiguresWithoutDocuments) {
    m_journal.jobs = {JobOf(7, JobState::Waiting, Hostile)};
    m_journal.paused = {""};
    m_status.running.resize(1);
    m_status.running[0].folder = "letters";
    m_status.running[0].name = Hostile;
    m_board.Put(m_status);
    Get("/healthz");
    m_server->Count("letters", "failed", 1013, "Word", 0.4);
    m_server->Count("letters", "vanished", 0, "", 0);
    m_server->CountRetry("letters");
    const std::string text = httplib::Client("http://" + m_server->Address()).Get("/metrics")->body;
    for (const char* line :
         {R"(quillon_documents_total{code="1013",folder="letters",state="failed"} 1)",
          R"(quillon_document_seconds_count{application="Word",folder="letters"} 1)",
          R"(quillon_document_seconds_bucket{application="Word",folder="letters",le="0.5"} 1)",
          R"(quillon_waiting{folder="letters"} 1)", R"(quillon_oldest_waiting_seconds{folder=)",
          R"(quillon_running{folder="letters"} 1)", R"(quillon_retries_total{folder="letters"} 1)",
          R"(quillon_free_bytes{folder="letters"} 4096)",
          R"(quillon_folder_reachable{folder="letters"} 1)",
          R"(quillon_paused{folder="letters"} 1)"})
        EXPECT_THAT(text, HasSubstr(line));
    EXPECT_THAT(text, Not(HasSubstr("alert")));
}

TEST_F(Page, ShowsTheMachinesThatShareTheJournal) {
    EXPECT_THAT(Get("/").body, Not(HasSubstr("Machines")));
    m_journal.jobs = {JobOf(7, JobState::Converting, "own.doc"),
                      JobOf(8, JobState::Converting, "others.doc")};
    m_journal.jobs[1].claimedBy = "b<:2";
    m_status.running.resize(1);
    m_status.running[0].job = 7;
    m_board.Put(m_status);
    Machine other = MachineOf("b<:2", "2.0");
    other.jobs = 4;
    other.running = 2;
    other.cannot = {"pub"};
    other.makers.fonts = "f1";
    Machine gone = MachineOf("c:3", "2.0");
    gone.isAlive = false;
    Machine replaced = gone;
    replaced.name = "a:0";
    replaced.seen -= std::chrono::minutes(1);
    m_journal.machines = {MachineOf("a:1", "2.0"), other, MachineOf("d:4", "2.0"), gone, replaced};
    m_journal.machines->front().obstacle = "<full>";

    const std::string page = Get("/").body;
    for (const char* shown : {"others.doc", "by b&lt;:2", "converts 4 at a time", "2 under way",
                              "differs: other fonts<", "has nothing to open pub with",
                              "&lt;full&gt;", "Not heard of", "<dd>2</dd>"})
        EXPECT_THAT(page, HasSubstr(shown));
    for (const char* hidden : {"own.doc", "a:0"}) // one has a line of its own, one an heir
        EXPECT_THAT(page, Not(HasSubstr(hidden)));
    EXPECT_EQ(Get("/healthz").status, 200);
    const std::string figures = Get("/metrics").body;
    for (const char* line :
         {R"(quillon_machine_up{machine="a:1"} 1)", R"(quillon_machine_up{machine="c:3"} 0)",
          R"(quillon_machine_running{machine="b<:2"} 2)",
          R"(quillon_machine_jobs{machine="b<:2"} 4)"})
        EXPECT_THAT(figures, HasSubstr(line));
}

TEST_F(Page, SpeaksItsReadersLanguage) {
    const TextsOfLanguages installed(
        ToText(FromArgument(QUILLON_PROGRAM).parent_path() / "locale"));
    const std::pair<const char*, const char*> cases[] = {
        {"de", "de"},
        {"de-AT,en;q=0.5", "de"},
        {"xx, ja;q=0.3, fr;q=0.8", "fr"},
        {"de;q=0,fr", "fr"},
        {"xx", "en"},
        {"", "en"},
        {"de;q=x, ja", "ja"},
        {";;,=,q", "en"},
        {"EN-us", "en"},
    };
    for (const auto& [header, language] : cases)
        EXPECT_EQ(installed.Choose(header).Language(), language) << header;
    EXPECT_NE((*installed.Find("de"))("%u converted"), "%u converted");
    EXPECT_EQ((*installed.Find("en")).Plural("%u accepted", "%u accepted", 2), "%u accepted");
    EXPECT_THAT(Get("/?lang=%22%3E", {{"Accept-Language", "xx"}}).body,
                HasSubstr("<html lang=\"en\""));
}

TEST_F(Page, IsServedOnlyWhereNobodyElseServes) {
    Get("/");
    Fault fault;
    const std::string bad[] = {"",      "nonsense",  "127.0.0.1",        "127.0.0.1:",
                               ":80",   "[::1:9188", "127.0.0.1:999999", "http://127.0.0.1:80",
                               "::1:9", "[::1]",     "192.0.2.1:9188",   m_server->Address()};
    for (const std::string& address : bad) {
        fault = {};
        EXPECT_FALSE(Start(address, fault)) << address;
        EXPECT_EQ(fault.blame, Blame::Usage) << address;
        EXPECT_FALSE(fault.advice.empty()) << address;
    }
    EXPECT_THAT(fault.what.utf8_string(), HasSubstr("another program serves there"));
    if (const auto other = Start("[::1]:0", fault)) {
        EXPECT_THAT(other->Address(), HasSubstr("[::1]:"));
    }
}

} // namespace
