#include "tests/standins/LoopbackListener.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <string_view>

LoopbackListener::LoopbackListener() : m_socket(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)) {
    sockaddr_in address{};
    socklen_t size = sizeof address;
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    EXPECT_EQ(0, bind(m_socket, reinterpret_cast<const sockaddr*>(&address), size));
    EXPECT_EQ(0, listen(m_socket, 16));
    getsockname(m_socket, reinterpret_cast<sockaddr*>(&address), &size);
    m_port = ntohs(address.sin_port);
    m_thread = std::thread([this] { Serve(); });
}

LoopbackListener::~LoopbackListener() {
    shutdown(m_socket, SHUT_RDWR); // accept returns
    m_thread.join();
    close(m_socket);
}

std::string LoopbackListener::Url() const {
    return "http://127.0.0.1:" + std::to_string(m_port) + "/";
}

void LoopbackListener::Serve() {
    constexpr std::string_view Nothing = "HTTP/1.1 404 Not Found\r\nContent-Length: 0\r\n"
                                         "Connection: close\r\n\r\n";
    for (;;) {
        const int client = accept4(m_socket, nullptr, nullptr, SOCK_CLOEXEC);
        if (client < 0)
            return;
        ++m_connections;
        send(client, Nothing.data(), Nothing.size(), MSG_NOSIGNAL);
        close(client);
    }
}
