#pragma once

#include <atomic>
#include <string>
#include <thread>

/// A web server on this machine that has nothing, and counts who comes.
class LoopbackListener {
public:
    LoopbackListener();
    ~LoopbackListener();
    LoopbackListener(const LoopbackListener&) = delete;
    LoopbackListener& operator=(const LoopbackListener&) = delete;

    /// Its address, with a slash at the end.
    std::string Url() const;
    int Connections() const { return m_connections; }

private:
    void Serve();

    int m_socket;
    int m_port = 0;
    std::atomic<int> m_connections = 0;
    std::thread m_thread;
};
