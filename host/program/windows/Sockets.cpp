#include "host/program/system/Sockets.h"

#include <winsock2.h>
#include <ws2tcpip.h>

bool Sockets::Await(Socket socket, Use use, std::chrono::milliseconds time) {
    WSAPOLLFD look = {static_cast<SOCKET>(socket),
                      static_cast<SHORT>(use == Use::Send ? POLLOUT : POLLIN), 0};
    return WSAPoll(&look, 1, static_cast<INT>(time.count())) > 0;
}

void Sockets::NeverBlock(Socket socket) {
    u_long yes = 1;
    ioctlsocket(static_cast<SOCKET>(socket), static_cast<long>(FIONBIO), &yes);
}

std::ptrdiff_t Sockets::Send(Socket socket, const char* bytes, std::size_t size) {
    return send(static_cast<SOCKET>(socket), bytes, static_cast<int>(size), 0);
}

void Sockets::ServeAlone(Socket socket) {
    const BOOL yes = TRUE;
    setsockopt(static_cast<SOCKET>(socket), SOL_SOCKET, SO_EXCLUSIVEADDRUSE,
               reinterpret_cast<const char*>(&yes), sizeof yes);
}

void Sockets::Close(Socket socket) {
    shutdown(static_cast<SOCKET>(socket), SD_BOTH);
    closesocket(static_cast<SOCKET>(socket));
}

Sockets::BindFailure Sockets::LastBindFailure() {
    switch (WSAGetLastError()) {
    case WSAEADDRINUSE:
        return BindFailure::InUse;
    case WSAEACCES: // what a socket that serves alone says of another one
        return BindFailure::InUse;
    default:
        return BindFailure::Other;
    }
}

bool Sockets::IsNumber(const std::string& host) {
    in6_addr number = {};
    return inet_pton(AF_INET, host.c_str(), &number) == 1 ||
           inet_pton(AF_INET6, host.c_str(), &number) == 1;
}

// There is no such signal.
Sockets::KeptSignal::KeptSignal() : m_handler(nullptr), m_flags(0) {}

void Sockets::KeptSignal::Restore() const {}
