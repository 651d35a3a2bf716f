#include "host/program/page/Connection.h"

#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <cctype>

namespace {

constexpr std::size_t LargestRequest = 16 << 10;
constexpr auto LongestRequest = std::chrono::seconds(3);
constexpr auto LongestRequestInHurry = std::chrono::milliseconds(300);
constexpr auto LongestAnswer = std::chrono::seconds(5);
constexpr int LookEvery = 50; // ms

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
    : m_socket(socket), m_inHurry(std::move(inHurry)) {}

Connection::~Connection() {
    shutdown(m_socket, SHUT_RDWR);
    close(m_socket);
}

bool Connection::Await(short event, Clock::time_point end) const {
    for (;;) {
        pollfd look = {m_socket, event, 0};
        const int found = poll(&look, 1, LookEvery);
        if (found > 0)
            return true;
        const Clock::time_point now = Clock::now();
        if ((found < 0 && errno != EINTR) || now > end ||
            (event == POLLIN && now > m_since + LongestRequestInHurry && m_inHurry()))
            return false;
    }
}

bool Connection::ReceiveMore() {
    char bytes[4096];
    if (m_received.size() >= LargestRequest || Clock::now() > m_since + LongestRequest ||
        !Await(POLLIN, m_since + LongestRequest))
        return false;
    const ssize_t size = recv(m_socket, bytes, sizeof bytes, MSG_DONTWAIT);
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
    return m_read < m_received.size() || Await(POLLIN, m_since + LongestRequest);
}

bool Connection::is_writable() const {
    return Await(POLLOUT, Clock::now() + LongestAnswer);
}

ssize_t Connection::read(char* bytes, std::size_t size) {
    if (m_read == m_received.size() && !ReceiveMore())
        return -1;
    const std::size_t count = m_received.copy(bytes, size, m_read);
    m_read += count;
    return static_cast<ssize_t>(count);
}

ssize_t Connection::write(const char* bytes, std::size_t size) {
    if (m_answeredSince == Clock::time_point())
        m_answeredSince = Clock::now();
    const Clock::time_point end = m_answeredSince + LongestAnswer;
    if (Clock::now() > end || !Await(POLLOUT, end))
        return -1;
    return send(m_socket, bytes, size, MSG_DONTWAIT | MSG_NOSIGNAL);
}

void Connection::get_remote_ip_and_port(std::string& ip, int& port) const {
    ip.clear(); // nobody asks
    port = 0;
}

void Connection::get_local_ip_and_port(std::string& ip, int& port) const {
    ip.clear();
    port = 0;
}
