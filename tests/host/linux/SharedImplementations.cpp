#include "host/program/journal/PostgresJournal.h"
#include "tests/host/JournalImplementation.h"
#include "tests/support/linux/PostgresServer.h"

#include <gtest/gtest.h>

namespace {

/// As the database has it.
std::string Expression(JournalTime time) {
    return "to_timestamp(" + std::to_string(std::chrono::system_clock::to_time_t(time)) + ")";
}

std::unique_ptr<Journal> OpenPostgres(const std::filesystem::path& folder, const JournalTime& now) {
    PostgresJournal::Options options;
    options.memory = std::chrono::milliseconds(0); // the test's clock does not stand for ours
    options.clock = [&now] { return Expression(now); };
    Fault fault;
    std::unique_ptr<Journal> journal = PostgresJournal::Open(
        PostgresServer::OfAllTests().Url(folder.filename()), std::move(options), fault);
    EXPECT_TRUE(journal) << fault.Text();
    return journal;
}

} // namespace

std::vector<JournalImplementation> SharedImplementations() {
    return {{"postgres", OpenPostgres, PostgresServer::Obstacle}};
}
