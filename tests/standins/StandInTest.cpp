#include "tests/standins/StandInTest.h"

#include "common/LoadedModule.h"
#include "machine/RegistryText.h"
#include "platform/win32/base/LogSink.h"
#include "tests/standins/Processes.h"

#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>

namespace fs = std::filesystem;

StandInTest::StandInTest(const char* module, const char* settings)
    : m_module(module), m_settings(settings), m_path(std::getenv("PATH")) {}

void StandInTest::SetUp() {
    setenv("TMPDIR", m_temporary.Path().c_str(), 1);
    win32::SetLogSink([this](const std::string& record) { m_log.push_back(record); });
    Call("DllRegisterServer");
}

void StandInTest::TearDown() {
    EXPECT_EQ("", Leftovers());
    wxRegKey(wxRegKey::HKCU, m_settings).DeleteSelf();
    setenv("PATH", m_path.c_str(), 1);
    unsetenv("TMPDIR");
    win32::SetLogSink(nullptr);
}

void StandInTest::Call(const char* function) const {
    const LoadedModule module(wxString::FromUTF8(m_module));
    auto* const called = module.Find<HRESULT STDMETHODCALLTYPE()>(function);
    ASSERT_TRUE(called) << function;
    EXPECT_EQ(S_OK, called()) << function;
}

void StandInTest::RegisterWithPath(const fs::path& folder) const {
    setenv("PATH", folder.c_str(), 1);
    Call("DllRegisterServer");
}

void StandInTest::SetLimit(const char* name, long seconds) const {
    wxRegKey key(wxRegKey::HKCU, m_settings);
    EXPECT_TRUE(key.Create() && key.SetValue(name, seconds));
}

std::string StandInTest::Engine() const {
    return MachineText(m_settings, "Engine");
}

std::string StandInTest::ReasonUnless(bool isDone) {
    const std::string last = m_log.empty() ? "no reason is given" : m_log.back();
    m_log.clear();
    return isDone ? std::string() : last;
}

std::string StandInTest::FailureLeft() {
    const auto text = [](const char* name) {
        const char* const key = "SOFTWARE\\Orvanta\\Stand-Ins\\Last Failure";
        return ReadRegistryText(wxRegKey::HKCU, key, name).value().utf8_string();
    };
    return text("Fault") + ": " + text("Reason");
}

pid_t StandInTest::AwaitEngine() const {
    std::vector<pid_t> engines;
    Await([&] { return !(engines = EnginesIn(m_temporary.Path())).empty(); });
    return engines.empty() ? 0 : engines.front();
}

pid_t StandInTest::AwaitSupervisor() const {
    AwaitEngine();
    const std::vector<pid_t> supervisors = SupervisorsIn(m_temporary.Path());
    return supervisors.empty() ? 0 : supervisors.front();
}

void StandInTest::Signal(pid_t process, int number) {
    ASSERT_GT(process, 0);
    EXPECT_EQ(0, kill(process, number));
}

void StandInTest::ExpectNothingOutlivesAKilledClient(
    const std::function<void()>& work, const std::function<pid_t()>& awaitEngine) const {
    for (const bool withSupervisor : {false, true}) {
        const pid_t client = fork();
        if (client == 0) {
            work();
            _exit(0);
        }
        EXPECT_GT(awaitEngine(), 0);
        const pid_t supervisor = withSupervisor ? AwaitSupervisor() : 0;
        if (withSupervisor)
            Signal(supervisor, SIGSTOP); // it does nothing when it sees the client go
        Signal(client, SIGKILL);
        waitpid(client, nullptr, 0);
        if (withSupervisor) {
            EndForCertain(supervisor);
            EXPECT_NE("", Leftovers()) << "there must be something for the next start to do";
            Call("DllRegisterServer");
        }
        EXPECT_TRUE(Await([&] { return Leftovers().empty(); })) << Leftovers();
    }
}

std::string StandInTest::Leftovers() const {
    std::string found;
    for (const fs::directory_entry& entry : fs::directory_iterator(m_temporary.Path())) {
        if (entry.path().filename().string().rfind("quillon-test-", 0) != 0) // that is the test's
            found += entry.path().string() + "\n";
    }
    for (const std::string& name : Names()) {
        if (name.find(".quillon-") != std::string::npos)
            found += name + "\n";
    }
    for (const auto& processes : {EnginesIn(m_temporary.Path()), SupervisorsIn(m_temporary.Path())})
        for (const pid_t process : processes)
            found += "process " + std::to_string(process) + "\n";
    return found;
}

std::set<std::string> StandInTest::Names() const {
    std::set<std::string> names;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(m_files.Path()))
        names.insert(fs::relative(entry.path(), m_files.Path()));
    return names;
}

std::string MachineText(const char* key, const char* name) {
    return ReadRegistryText(wxRegKey::HKLM, key, name).value_or(wxString()).utf8_string();
}
