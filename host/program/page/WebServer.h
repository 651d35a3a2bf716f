#pragma once

#include "host/program/page/PageAddress.h"
#include "host/program/system/Sockets.h"

#include <httplib.h>

#include <condition_variable>
#include <mutex>
#include <thread>

/// The library's server in threads of its own, few of them, whatever clients do; it begins anew
/// when the system ends it. Its routes are set before it serves.
class WebServer : private Sockets::KeptSignal, private httplib::Server {
public:
    WebServer();
    ~WebServer() override;
    WebServer(const WebServer&) = delete;
    WebServer& operator=(const WebServer&) = delete;

    using Server::Get;
    using Server::Post;
    using Server::set_default_headers;
    using Server::set_error_handler;
    using Server::set_exception_handler;
    using Server::set_pre_routing_handler;

    /// Takes the address for itself.
    /// @param address receives the port that it got
    /// @return why not
    std::optional<Fault> Bind(PageAddress& address);

    void Serve();

private:
    class Pool;

    bool process_and_close_socket(socket_t socket) override;
    httplib::TaskQueue* BeginListening();
    void ListenUntilStopped();

    PageAddress m_address;
    std::atomic<unsigned> m_waiting{0}; ///< connections that no thread has yet
    std::mutex m_mutex;
    std::condition_variable m_changed;
    bool m_isListening = false;
    std::atomic<bool> m_isStopping{false};
    std::thread m_thread;
};
