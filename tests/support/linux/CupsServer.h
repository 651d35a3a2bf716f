#pragma once

#include "tests/support/TemporaryFolder.h"

#include <cups/cups.h>
#include <sys/types.h>

#include <memory>
#include <string>

/// A print server of the test's own: all of its folders are its, and its clients reach it by a
/// socket that nobody else knows. The machine's own is not touched. As root, it runs as the user
/// nobody. The clients of this process, and those that it starts, speak to it as long as it lives.
class CupsServer {
public:
    /// What has become of a job.
    struct Job {
        ipp_jstate_t state = IPP_JSTATE_PENDING;
        int impressions = 0;
        std::string message; ///< why it does not go on
    };

    /// Makes the folders; starts nothing yet.
    CupsServer();
    ~CupsServer();
    CupsServer(const CupsServer&) = delete;
    CupsServer& operator=(const CupsServer&) = delete;

    /// Why there can be none on this machine for a program; empty when there can.
    static std::string Obstacle(const std::filesystem::path& program);

    /// Starts it, and waits until it answers; the test fails when it does not.
    void Start();
    /// Has it end as its administrator would.
    void Stop();
    /// Ends it as a power failure would.
    void Kill();

    /// @param device where it prints to: "file:…", or a backend
    /// @param ppd the file that describes the printer
    void AddQueue(const std::string& name, const std::string& device,
                  const std::filesystem::path& ppd);

    /// Adds a shell script as what brings jobs to devices "NAME:…".
    void AddBackend(const std::string& name, const std::string& script) const;

    /// @return a value of no sense where there is no such job
    Job Look(int job) const;
    /// What is told of a printer.
    std::string PrinterMessage(const std::string& queue) const;

    std::filesystem::path Folder() const { return m_folder.Path(); }
    std::filesystem::path ServerRoot() const { return m_folder / "etc"; }
    std::filesystem::path ServerBin() const { return m_folder / "lib"; }
    /// Of its filters.
    std::filesystem::path TemporaryFiles() const { return m_folder / "tmp"; }
    std::filesystem::path Socket() const { return m_folder / "socket"; }

private:
    using Answer = std::unique_ptr<ipp_t, void (*)(ipp_t*)>;

    void LinkPrograms() const;
    void Configure() const;
    Answer Ask(ipp_t* request, const std::string& resource,
               const std::filesystem::path& file = {}) const;
    void End(int signal);

    TemporaryFolder m_folder;
    pid_t m_process = -1;
};
