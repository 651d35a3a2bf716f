#pragma once

#include <httplib.h>

#include <chrono>
#include <functional>
#include <optional>
#include <string>

/// A client's connection, for one request and its answer. Neither may be larger or take longer
/// than is good for the others: a client that sends a letter a second would keep a thread for
/// itself otherwise.
class Connection : public httplib::Stream {
public:
    /// @param socket closed with the connection
    /// @param inHurry whether others wait for the thread, so that only who is quick is served
    Connection(socket_t socket, std::function<bool()> inHurry);
    ~Connection() override;
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    /// Waits for the request's line and headers.
    /// @return false when they do not come, or are none that we want
    bool ReadHead();

    bool is_readable() const override;
    bool is_writable() const override;
    ssize_t read(char* bytes, std::size_t size) override;
    ssize_t write(const char* bytes, std::size_t size) override;
    void get_remote_ip_and_port(std::string& ip, int& port) const override;
    void get_local_ip_and_port(std::string& ip, int& port) const override;
    socket_t socket() const override { return m_socket; }

private:
    using Clock = std::chrono::steady_clock;

    bool AwaitRequest() const;
    bool AwaitAnswer() const;
    bool ReceiveMore();

    const socket_t m_socket;
    const std::function<bool()> m_inHurry;
    const Clock::time_point m_since = Clock::now();
    std::optional<Clock::time_point> m_answeredSince; ///< when its first byte went
    std::string m_received;
    std::size_t m_read = 0; ///< of that
};
