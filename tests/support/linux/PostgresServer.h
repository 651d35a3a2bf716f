#pragma once

#include "tests/support/TemporaryFolder.h"

#include <sys/types.h>

#include <string>
#include <vector>

/// A PostgreSQL server of the test's own: its data and its socket lie in a folder that nobody else
/// knows. As root, it runs as the user nobody. Everybody is let in but the user strict, who needs a
/// password. It ends with this process, whatever becomes of that.
class PostgresServer {
public:
    /// Makes its data; starts nothing yet.
    /// @param syncs whether what is committed survives a power failure, and takes its time
    explicit PostgresServer(bool syncs = false);
    ~PostgresServer();
    PostgresServer(const PostgresServer&) = delete;
    PostgresServer& operator=(const PostgresServer&) = delete;

    /// Why there can be none on this machine; empty when there can.
    static std::string Obstacle();
    /// One that runs for all tests of this process.
    static PostgresServer& OfAllTests();

    /// Starts it, and waits until it answers; the test fails when it does not.
    void Start();
    /// Has it end as its administrator would.
    void Stop();
    /// Ends it with all of its processes, as a power failure would.
    void Kill();

    /// @param schema where the tables are to be; is made when it is not there
    /// @param user with a password after a colon, as the case may be
    std::string Url(const std::string& schema, const std::string& user = "postgres") const;

    /// Runs statements as the superuser.
    void Run(const std::string& statements) const;

private:
    std::string Address(const std::string& user) const;

    TemporaryFolder m_folder;
    bool m_syncs;
    pid_t m_process = -1;
};
