#include "tests/support/linux/PostgresServer.h"

#include <gtest/gtest.h>
#include <libpq-fe.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <fstream>
#include <memory>
#include <thread>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr const char* Versions = "/usr/lib/postgresql";
constexpr uid_t Nobody = 65534;

constexpr const char* LetIn = "local all strict scram-sha-256\nlocal all all trust\n";

/// The programs of the newest server that is installed; empty when there is none.
fs::path Programs() {
    fs::path newest;
    if (fs::exists(Versions))
        for (const auto& version : fs::directory_iterator(Versions))
            if (fs::exists(version.path() / "bin" / "initdb"))
                newest = std::max(newest, version.path() / "bin");
    return newest;
}

/// Starts a program as the user that the server runs as; it ends with this process.
pid_t Spawn(std::vector<std::string> words) {
    const std::string user = std::to_string(Nobody);
    std::vector<std::string> all = {"/usr/bin/setpriv", "--pdeathsig", "QUIT"};
    if (geteuid() == 0)
        all.insert(all.end(), {"--reuid", user, "--regid", user, "--clear-groups"});
    all.emplace_back("--");
    all.insert(all.end(), words.begin(), words.end());
    std::vector<char*> arguments;
    arguments.reserve(all.size() + 1);
    for (std::string& word : all)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    pid_t process = -1;
    EXPECT_EQ(posix_spawn(&process, arguments[0], nullptr, nullptr, arguments.data(), environ), 0);
    return process;
}

void GiveToServer(const fs::path& folder) {
    if (geteuid() != 0)
        return;
    EXPECT_EQ(lchown(folder.c_str(), Nobody, Nobody), 0) << folder;
    for (const auto& entry : fs::recursive_directory_iterator(folder))
        EXPECT_EQ(lchown(entry.path().c_str(), Nobody, Nobody), 0) << entry.path();
}

/// A folder of data as a new server has it. It takes a while to make: all tests that are run from
/// this build have one, of which they take copies.
fs::path NewData() {
    fs::path data = TEST_CLUSTER;
    if (fs::exists(data))
        return data;
    const TemporaryFolder folder;
    GiveToServer(folder.Path());
    const pid_t maker =
        Spawn({Programs() / "initdb", "-D", folder / "data", "-A", "trust", "-U", "postgres", "-E",
               "UTF8", "--locale=C", "--no-sync", "--no-instructions", "--wal-segsize=1"});
    int status = 0;
    waitpid(maker, &status, 0);
    EXPECT_EQ(status, 0) << "initdb";
    folder.Write("data/pg_hba.conf", LetIn);
    const std::string own = data.string() + "." + std::to_string(getpid());
    fs::copy(folder / "data", own, fs::copy_options::recursive);
    std::error_code another; // test has made it meanwhile
    fs::rename(own, data, another);
    if (another)
        fs::remove_all(own);
    return data;
}

/// For a URL.
std::string Encoded(const std::string& text) {
    std::string encoded;
    for (const char each : text)
        encoded += each == '/' ? std::string("%2F") : std::string(1, each);
    return encoded;
}

} // namespace

PostgresServer::PostgresServer(bool syncs) : m_syncs(syncs) {
    fs::copy(NewData(), m_folder / "data", fs::copy_options::recursive);
    fs::permissions(m_folder / "data", fs::perms::owner_all);
    GiveToServer(m_folder.Path());
}

PostgresServer::~PostgresServer() {
    Kill();
}

std::string PostgresServer::Obstacle() {
    return Programs().empty() ? "PostgreSQL is not installed" : "";
}

PostgresServer& PostgresServer::OfAllTests() {
    static PostgresServer server;
    if (server.m_process <= 0)
        server.Start();
    return server;
}

void PostgresServer::Start() {
    m_process =
        Spawn({Programs() / "postgres", "-D", m_folder / "data", "-c", "listen_addresses=", "-c",
               "unix_socket_directories=" + m_folder.Path().string(), "-c",
               m_syncs ? "fsync=on" : "fsync=off", "-c", "log_destination=stderr", "-c",
               "logging_collector=on", "-c", "log_directory=" + m_folder.Path().string()});
    const std::string url = Address("postgres");
    const auto end = std::chrono::steady_clock::now() + 20s;
    while (PQping(url.c_str()) != PQPING_OK) {
        ASSERT_LT(std::chrono::steady_clock::now(), end) << "PostgreSQL does not start";
        std::this_thread::sleep_for(5ms);
    }
}

void PostgresServer::Stop() {
    if (m_process <= 0)
        return;
    kill(m_process, SIGINT); // without waiting for its clients
    waitpid(m_process, nullptr, 0);
    m_process = -1;
}

void PostgresServer::Kill() {
    if (m_process <= 0)
        return;
    kill(m_process, SIGSTOP); // so that it starts no more
    const std::string number = std::to_string(m_process);
    std::ifstream children("/proc/" + number + "/task/" + number + "/children");
    for (pid_t child = 0; children >> child;)
        kill(child, SIGKILL);
    kill(m_process, SIGKILL);
    waitpid(m_process, nullptr, 0);
    m_process = -1;
}

std::string PostgresServer::Address(const std::string& user) const {
    return "postgres://" + user + "@/postgres?host=" + Encoded(m_folder.Path().string());
}

std::string PostgresServer::Url(const std::string& schema, const std::string& user) const {
    Run("SET client_min_messages = warning; CREATE SCHEMA IF NOT EXISTS \"" + schema + "\"");
    return Address(user) + "&options=-csearch_path%3D%22" + schema + "%22";
}

void PostgresServer::Run(const std::string& statements) const {
    const std::unique_ptr<PGconn, void (*)(PGconn*)> connection(
        PQconnectdb(Address("postgres").c_str()), PQfinish);
    const std::unique_ptr<PGresult, void (*)(PGresult*)> result(
        PQexec(connection.get(), statements.c_str()), PQclear);
    EXPECT_LE(PQresultStatus(result.get()), PGRES_TUPLES_OK) << PQerrorMessage(connection.get());
}
