#pragma once

#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <functional>
#include <set>
#include <string>
#include <vector>

/// A machine with stand-ins registered. Their temporary files go to a folder of the test's own, and
/// what they log is kept. After the test no process and no file of theirs may be left.
class StandInTest : public testing::Test {
protected:
    /// @param module the module that registers them, full path
    /// @param settings the registry key of their settings
    StandInTest(const char* module, const char* settings);

    void SetUp() override;
    void TearDown() override;

    /// Calls a function of the module: "DllRegisterServer" or "DllUnregisterServer".
    void Call(const char* function) const;
    /// Registers the stand-ins anew with a PATH of one folder.
    void RegisterWithPath(const std::filesystem::path& folder) const;

    /// Sets one of the stand-ins' limits, "StallSeconds" or "TotalSeconds".
    void SetLimit(const char* name, long seconds) const;
    /// The name of the engine that the registry tells of; empty when it tells of none.
    std::string Engine() const;

    /// The log's last record if something has failed, else nothing. The log is empty afterwards.
    std::string ReasonUnless(bool isDone);
    /// What the stand-ins have left for the host of their last failure: what is to blame, a colon
    /// and the reason.
    static std::string FailureLeft();

    /// Waits for an engine at work.
    /// @return 0 when none comes up
    pid_t AwaitEngine() const;
    /// Waits for a supervisor with an engine at work.
    pid_t AwaitSupervisor() const;
    /// @param process has been waited for; the test fails when it is 0
    static void Signal(pid_t process, int number);
    /// Has a process of its own do `work`, kills it when `awaitEngine` has found an engine, and
    /// expects that nothing is left. Then the same with the supervisor killed along: what it leaves
    /// is to be gone with the next start of a client.
    void ExpectNothingOutlivesAKilledClient(const std::function<void()>& work,
                                            const std::function<pid_t()>& awaitEngine) const;

    /// What the stand-ins have left so far: work folders, unfinished output and processes, a line
    /// for each; empty when all is clean.
    std::string Leftovers() const;
    /// The names of the files and folders among the documents and output.
    std::set<std::string> Names() const;

    TemporaryFolder m_files; ///< documents and output
    TemporaryFolder m_temporary;
    std::vector<std::string> m_log;

private:
    const char* m_module;
    const char* m_settings;
    std::string m_path; ///< as it was
};

/// A text value of the machine's registry; empty when there is none.
std::string MachineText(const char* key, const char* name);
