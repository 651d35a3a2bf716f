// What the program tells a manager of services, which is a socket here.

#include "host/program/system/ServiceManager.h"

#include "tests/host/WatchRun.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <functional>

using namespace std::chrono_literals;
using testing::MatchesRegex;

namespace {

class ServiceManagerTest : public WatchRun {
protected:
    void SetUp() override {
        sockaddr_un address = {};
        address.sun_family = AF_UNIX;
        const std::string path = (m_folder / "notify").string();
        path.copy(address.sun_path, sizeof address.sun_path - 1);
        ASSERT_EQ(bind(m_socket, reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
        setenv("NOTIFY_SOCKET", path.c_str(), 1);
        setenv("WATCHDOG_USEC", "30000000", 1);
    }
    void TearDown() override {
        for (const char* name : {"NOTIFY_SOCKET", "WATCHDOG_USEC", "WATCHDOG_PID"})
            unsetenv(name);
        close(m_socket);
    }

    /// What has come; nothing is waited for, since it is there when its sender goes on.
    std::string Received() const {
        std::string text(4096, '\0');
        const ssize_t size = recv(m_socket, text.data(), text.size(), MSG_DONTWAIT);
        text.resize(static_cast<std::size_t>(std::max<ssize_t>(size, 0)));
        return text;
    }

    /// Waits until it is told what begins so, and nothing but signs of life and words before.
    testing::AssertionResult Await(const std::string& beginning) const {
        for (pollfd look = {m_socket, POLLIN, 0}; poll(&look, 1, 20000) == 1;) {
            const std::string received = Received();
            if (received.rfind(beginning, 0) == 0)
                return testing::AssertionSuccess();
            if (received.rfind("STATUS=", 0) != 0 && received != "WATCHDOG=1")
                return testing::AssertionFailure() << received;
        }
        return testing::AssertionFailure() << "silence";
    }

private:
    int m_socket = socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0);
};

TEST_F(ServiceManagerTest, IsToldWhatItUnderstands) {
    const struct {
        std::function<void()> tell;
        const char* received;
    } rows[] = {
        {ServiceManager::TellReady, "READY=1"},
        {ServiceManager::TellAlive, "WATCHDOG=1"},
        {ServiceManager::TellReloading, "RELOADING=1\nMONOTONIC_USEC=[1-9][0-9]*"},
        {[] { ServiceManager::TellStopping(90s); }, "STOPPING=1\nEXTEND_TIMEOUT_USEC=90000000"},
        {[] { ServiceManager::TellStatus(wxString::FromUTF8("2 über\nREADY=1")); },
         "STATUS=2 über READY=1"},
    };
    for (const auto& row : rows) {
        row.tell();
        EXPECT_THAT(Received(), MatchesRegex(row.received));
        EXPECT_EQ(Received(), "");
    }
}

TEST_F(ServiceManagerTest, IsToldNothingWhereThereIsNone) {
    unsetenv("NOTIFY_SOCKET");
    ServiceManager::TellReady();
    EXPECT_EQ(Received(), "");
}

TEST_F(ServiceManagerTest, WantsASignOfLifeOfTheProcessThatItStarted) {
    EXPECT_EQ(ServiceManager::WatchdogPeriod(), 30s);
    setenv("WATCHDOG_PID", "1", 1); // its child inherits what it was told
    EXPECT_EQ(ServiceManager::WatchdogPeriod(), 0s);
    unsetenv("WATCHDOG_USEC");
    EXPECT_EQ(ServiceManager::WatchdogPeriod(), 0s);
}

TEST_F(ServiceManagerTest, IsToldOfAWatchFromItsBeginningToItsEnd) {
    Configure();
    Put("slow.doc", "wait=" + Path("go"));
    const RunningProgram program(QuillonCommand(Watch()));
    EXPECT_TRUE(Await("READY=1"));
    EXPECT_TRUE(Await("WATCHDOG=1"));
    EXPECT_TRUE(Await("STATUS=1 under way"));
    program.Terminate();
    EXPECT_TRUE(Await("STOPPING=1\nEXTEND_TIMEOUT_USEC="));
}

} // namespace
