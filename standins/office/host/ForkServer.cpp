#include "standins/office/host/ForkServer.h"

#include "standins/office/host/DocumentWork.h"
#include "standins/office/host/SiblingFork.h"

#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <system_error>
#include <thread>

using namespace std::chrono_literals;

namespace standins {

namespace {

/// LibreOffice leaves threads of its own to end by themselves, when a spreadsheet is read.
/// @return whether this process has one thread only
bool AwaitSingleThread() {
    const auto giveUp = std::chrono::steady_clock::now() + 2s;
    while (CountThreads() != 1) {
        if (std::chrono::steady_clock::now() > giveUp)
            return false;
        std::this_thread::sleep_for(1ms);
    }
    return true;
}

} // namespace

ForkServer::ForkServer(Channel& supervisor, Reach reach)
    : m_supervisor(supervisor), m_reach(std::move(reach)), m_parent(getppid()) {}

void ForkServer::Serve() {
    if (AwaitSingleThread())
        m_supervisor.Send(MessageKind::Ready);
    else
        m_supervisor.Send(MessageKind::Failed, "LibreOffice keeps threads running");
    while (const std::optional<Message> message = m_supervisor.Receive()) {
        const std::optional<HostOrder> order = DecodeHostOrder(message->text);
        if (!order)
            break;
        Answer(*order, message->attachment);
    }
    _exit(EXIT_SUCCESS);
}

void ForkServer::Answer(const HostOrder& order, const Descriptor& log) {
    if (!AwaitSingleThread()) {
        m_supervisor.Send(MessageKind::Failed, "LibreOffice keeps threads running");
        return;
    }
    const pid_t child = ForkSibling();
    if (child == 0) {
        m_supervisor = Channel(Descriptor()); // a document has nothing to say to it
        DoWork(order, log, m_parent, m_reach);
    }
    if (child > 0)
        m_supervisor.Send(MessageKind::Started, std::to_string(child));
    else
        m_supervisor.Send(MessageKind::Failed, std::generic_category().message(errno));
}

} // namespace standins
