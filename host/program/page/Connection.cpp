#include "host/program/page/Connection.h"

#include "host/program/system/Sockets.h"

#include <algorithm>
#include <cctype>

namespace {

constexpr std::size_t LargestRequest = 16 << 10;
constexpr auto LongestRequest = std::chrono::seconds(3);
constexpr auto LongestRequestInHurry = std::chrono::milliseconds(300);
constexpr auto LongestAnswer = std::chrono::seconds(5);
constexpr auto LookEvery = std::chrono::milliseconds(50);

/// Parts of what we serve are asked for by nobody, and the library reads a long list of them with
/// a recursion as deep.
bool AsksForParts(const std::string& head) {
    constexpr std::string_view Header = "\nrange:";
    return std::search(head.begin(), head.end(), Header.begin(), Header.end(),
                       [](unsigned char c, char wanted) { return std::tolower(c) == wanted; }) !=
           head.end();
}

} // namespace

Connection::Connection(socket_t socket, std::function<bool()> inHurry)
    : m_socket(socket), m_inHurry(std::move(inHurry)) {
    Sockets::NeverBlock(static_cast<Sockets::Socket>(socket));
}

Connection::~Connection() {
    Sockets::Close(static_cast<Sockets::Socket>(m_socket));
}

bool Connection::AwaitRequest() const {
    while (
        !Sockets::Await(static_cast<Sockets::Socket>(m_socket), Sockets::Use::Receive, LookEvery)) {
        const auto age = Clock::now() - m_since;
        if (age > LongestRequest || (age > LongestRequestInHurry && m_inHurry()))
            return false;
    }
    return true;
}

bool Connection::AwaitAnswer() const {
    const auto left = m_answeredSince.value_or(Clock::now()) + LongestAnswer - Clock::now();
    return left > Clock::duration::zero() &&
           Sockets::Await(static_cast<Sockets::Socket>(m_socket), Sockets::Use::Send,
                          std::chrono::duration_cast<std::chrono::milliseconds>(left));
}

bool Connection::ReceiveMore() {
    char bytes[4096];
    if (m_received.size() >= LargestRequest || Clock::now() > m_since + LongestRequest ||
        !AwaitRequest())
        return false;
    const auto size = recv(m_socket, bytes, sizeof bytes, 0);
    if (size > 0)
        m_received.append(bytes, static_cast<std::size_t>(size));
    return size > 0;
}

bool Connection::ReadHead() {
    std::size_t end = std::string::npos;
    while ((end = m_received.find("\r\n\r\n")) == std::string::npos)
        if (!ReceiveMore())
            return false;
    return !AsksForParts(m_received.substr(0, end));
}

bool Connection::is_readable() const {
    return m_read < m_received.size() || AwaitRequest();
}

bool Connection::is_writable() const {
    return AwaitAnswer();
}

ssize_t Connection::read(char* bytes, std::size_t size) {
    if (m_read == m_received.size() && !ReceiveMore())
        return -1;
    const std::size_t count = m_received.copy(bytes, size, m_read);
    m_read += count;
    return static_cast<ssize_t>(count);
}

ssize_t Connection::write(const char* bytes, std::size_t size) {
    if (!m_answeredSince)
        m_answeredSince = Clock::now();
    return AwaitAnswer() ? Sockets::Send(static_cast<Sockets::Socket>(m_socket), bytes, size) : -1;
}

void Connection::get_remote_ip_and_port(std::string& ip, int& port) const {
    ip.clear(); // nobody asks
    port = 0;
}

void Connection::get_local_ip_and_port(std::string& ip, int& port) const {
    ip.clear();
    port = 0;
}
