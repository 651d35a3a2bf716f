#include "host/program/system/Sockets.h"

#include <arpa/inet.h>
#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>

bool Sockets::Await(Socket socket, Use use, std::chrono::milliseconds time) {
    pollfd look = {static_cast<int>(socket),
                   static_cast<short>(use == Use::Send ? POLLOUT : POLLIN), 0};
    return poll(&look, 1, static_cast<int>(time.count())) > 0;
}

void Sockets::NeverBlock(Socket socket) {
    const int number = static_cast<int>(socket);
    fcntl(number, F_SETFL, fcntl(number, F_GETFL) | O_NONBLOCK);
}

std::ptrdiff_t Sockets::Send(Socket socket, const char* bytes, std::size_t size) {
    return send(static_cast<int>(socket), bytes, size, MSG_NOSIGNAL);
}

void Sockets::ServeAlone(Socket socket) {
    const int yes = 1; // for an address whose last connections have just ended, and no more
    setsockopt(static_cast<int>(socket), SOL_SOCKET, SO_REUSEADDR, &yes, sizeof yes);
}

void Sockets::Close(Socket socket) {
    shutdown(static_cast<int>(socket), SHUT_RDWR);
    close(static_cast<int>(socket));
}

Sockets::BindFailure Sockets::LastBindFailure() {
    switch (errno) {
    case EADDRINUSE:
        return BindFailure::InUse;
    case EACCES:
        return BindFailure::NotAllowed;
    default:
        return BindFailure::Other;
    }
}

bool Sockets::IsNumber(const std::string& host) {
    in6_addr number = {};
    return inet_pton(AF_INET, host.c_str(), &number) == 1 ||
           inet_pton(AF_INET6, host.c_str(), &number) == 1;
}

Sockets::KeptSignal::KeptSignal() {
    struct sigaction action = {};
    sigaction(SIGPIPE, nullptr, &action);
    m_handler = action.sa_handler;
    m_flags = action.sa_flags;
}

void Sockets::KeptSignal::Restore() const {
    struct sigaction action = {};
    action.sa_handler = m_handler;
    action.sa_flags = m_flags;
    sigemptyset(&action.sa_mask);
    sigaction(SIGPIPE, &action, nullptr);
}
