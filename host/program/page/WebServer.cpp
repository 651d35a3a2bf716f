#include "host/program/page/WebServer.h"

#include "common/WQServices.h"
#include "host/program/page/Connection.h"

#include <wx/intl.h>

namespace {

constexpr std::size_t Threads = 4;
constexpr unsigned MostWaiting = 16; // more stay with the system, and take none of our descriptors
constexpr std::size_t LargestForm = 4 << 10;
constexpr auto RestBetweenStarts = std::chrono::seconds(1);

Fault FaultOfBinding(const PageAddress& address, Sockets::BindFailure failure) {
    const wxString where = wxString::FromUTF8(address.Text());
    const Fault fault{wxString::Format(_("the page cannot be served at %s"), where), Blame::Usage};
    const auto with = [&fault](const wxString& why, const wxString& advice) {
        return Fault{fault.what + ": " + why, fault.blame, fault.code, advice};
    };
    switch (failure) {
    case Sockets::BindFailure::InUse:
        return with(_("another program serves there"),
                    _("End that program, or name another port for the page"));
    case Sockets::BindFailure::NotAllowed:
        return with(_("only the administrator may use this port"),
                    _("Name a port from 1024 on for the page"));
    case Sockets::BindFailure::Other:
        break;
    }
    return with(_("this machine has no such address"),
                _("Name one that it has, for instance 127.0.0.1:9188"));
}

} // namespace

/// Takes a connection only when there is room for it.
class WebServer::Pool : public httplib::ThreadPool {
public:
    explicit Pool(std::atomic<unsigned>& waiting) : ThreadPool(Threads), m_waiting(waiting) {}

    void enqueue(std::function<void()> serve) override {
        std::unique_lock lock(m_mutex);
        m_hasRoom.wait(lock, [this] { return m_waiting < MostWaiting; });
        ++m_waiting;
        ThreadPool::enqueue([this, serve = std::move(serve)] {
            {
                const std::lock_guard taken(m_mutex);
                --m_waiting;
            }
            m_hasRoom.notify_one();
            serve();
        });
    }

private:
    std::atomic<unsigned>& m_waiting;
    std::mutex m_mutex;
    std::condition_variable m_hasRoom;
};

WebServer::WebServer() {
    set_payload_max_length(LargestForm);
    Restore();                               // what the base class has done to the signal
    set_socket_options([](socket_t socket) { // the library would share the port with others
        Sockets::ServeAlone(static_cast<Sockets::Socket>(socket));
    });
    new_task_queue = [this] { return BeginListening(); };
}

WebServer::~WebServer() {
    {
        const std::lock_guard lock(m_mutex);
        m_isStopping = true;
        if (m_isListening)
            stop();
    }
    m_changed.notify_all();
    if (m_thread.joinable())
        m_thread.join();
}

std::optional<Fault> WebServer::Bind(PageAddress& address) {
    const int port = address.port == 0                          ? bind_to_any_port(address.host)
                     : bind_to_port(address.host, address.port) ? address.port
                                                                : -1;
    if (port < 0)
        return FaultOfBinding(address, Sockets::LastBindFailure());
    address.port = port;
    m_address = address;
    return std::nullopt;
}

void WebServer::Serve() {
    m_thread = std::thread([this] { ListenUntilStopped(); });
}

/// The library asks for threads when it begins to listen, and can be stopped from then on.
httplib::TaskQueue* WebServer::BeginListening() {
    const std::lock_guard lock(m_mutex);
    m_isListening = true;
    if (m_isStopping)
        stop();
    return std::make_unique<Pool>(m_waiting).release(); // the library owns it
}

void WebServer::ListenUntilStopped() {
    for (bool isBound = true;;) {
        if (isBound)
            listen_after_bind();
        std::unique_lock lock(m_mutex);
        m_isListening = false;
        if (m_isStopping)
            return;
        if (isBound) // the system has failed to hand over a connection, which ends the library's
                     // loop
            SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
                << "The page's server has ended, and is started anew.";
        m_changed.wait_for(lock, RestBetweenStarts, [this] { return m_isStopping.load(); });
        isBound = !m_isStopping && bind_to_port(m_address.host, m_address.port);
    }
}

bool WebServer::process_and_close_socket(socket_t socket) {
    Connection connection(socket, [this] { return m_waiting > 0 || m_isStopping; });
    bool isClosed = false;
    return connection.ReadHead() && process_request(connection, true, isClosed, nullptr);
}
