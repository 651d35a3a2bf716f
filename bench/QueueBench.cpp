#include "host/program/journal/PostgresJournal.h"
#include "tests/support/linux/PostgresServer.h"

#include <wx/init.h>

#include <atomic>
#include <cstdio>
#include <thread>

// Measures a queue that has been in use for a while: a million documents are done with, and a
// hundred thousand wait in a hundred folders. What is committed is on the disk.

namespace {

using Clock = std::chrono::steady_clock;
using namespace std::chrono_literals;

constexpr const char* Schema = "queue";
constexpr auto Duration = 5s;

constexpr const char* Past = R"(SET search_path = queue;
INSERT INTO job (folder, source, inside, kind, device, number, size, modified, digest, priority,
                 state, open, attempts, inserted, due, begun, ended, changed, output)
SELECT 'folder' || n % 100, 'office:/done/' || n || '.docx', '', 'docx', 1, n, 20000, n, md5(n::text),
       50, CASE WHEN n <= 1000000 THEN 'archived' ELSE 'waiting' END, n > 1000000, 1,
       now(), now(), now(), now(), now(), 'office:/out/' || n || '.pdf'
FROM generate_series(1, 1100000) AS n)";

std::unique_ptr<Journal> Open(const PostgresServer& server) {
    Fault fault;
    auto journal = PostgresJournal::Open(server.Url(Schema), {}, fault);
    if (!journal)
        std::fputs(fault.Text().utf8_str(), stderr);
    return journal;
}

/// A worker's statements for a document, once it has it.
void Finish(Journal& journal, Job job) {
    for (const JobState state : {JobState::Delivering, JobState::Finished, JobState::Archived}) {
        job.state = state;
        job.open = state != JobState::Archived;
        journal.Commit(job);
    }
}

/// @return documents a second
double Measure(const PostgresServer& server, int clients, bool finishes) {
    std::vector<ClaimableFolder> folders;
    folders.reserve(100);
    for (int number = 0; number < 100; ++number)
        folders.push_back({wxString::Format("folder%d", number)});
    std::atomic<int> documents{0};
    std::vector<std::thread> threads;
    threads.reserve(static_cast<std::size_t>(clients));
    const Clock::time_point start = Clock::now();
    for (int client = 0; client < clients; ++client)
        threads.emplace_back([&, journal = std::shared_ptr<Journal>(Open(server)), client] {
            const Claimant claimant = {wxString::Format("client%d", client), 30s};
            while (Clock::now() - start < Duration) {
                const std::optional<Job> job = journal->Claim(folders, claimant);
                documents += job ? 1 : 0;
                if (job && finishes)
                    Finish(*journal, *job);
            }
        });
    for (std::thread& thread : threads)
        thread.join();
    return documents / std::chrono::duration<double>(Clock::now() - start).count();
}

} // namespace

int main() {
    const wxInitializer toolkit;
    PostgresServer server(true);
    server.Start();
    if (!toolkit.IsOk() || !Open(server))
        return 2;
    std::puts("Making a million documents");
    server.Run(Past);
    server.Run("VACUUM ANALYZE queue.job");
    for (const int clients : {1, 4, 8}) {
        const double claims = Measure(server, clients, false);
        const double documents = Measure(server, clients, true);
        std::printf("%d clients: %.0f claims a second; %.0f documents a second claimed and "
                    "finished, %.1f ms each\n",
                    clients, claims, documents, 1000 * clients / documents);
    }
    return 0;
}
