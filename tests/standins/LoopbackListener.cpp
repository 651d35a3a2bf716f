#include "tests/standins/LoopbackListener.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <sys/socket.h>

LoopbackListener::LoopbackListener() : m_socket(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)) {
    sockaddr_in address{};
    socklen_t size = sizeof address;
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    EXPECT_EQ(0, bind(m_socket.Get(), reinterpret_cast<const sockaddr*>(&address), size));
    EXPECT_EQ(0, listen(m_socket.Get(), 16));
    getsockname(m_socket.Get(), reinterpret_cast<sockaddr*>(&address), &size);
    m_port = ntohs(address.sin_port);
}

bool LoopbackListener::HasVisitor() const {
    pollfd event{m_socket.Get(), POLLIN, 0};
    return poll(&event, 1, 0) > 0;
}
