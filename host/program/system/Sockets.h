#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <string>

/// What systems have in common of sockets, but call otherwise. A socket is as the system has it.
namespace Sockets {

using Socket = std::intptr_t;

enum class Use { Receive, Send };

/// Waits until the socket is ready or has failed.
/// @return false when the time was up before
bool Await(Socket socket, Use use, std::chrono::milliseconds time);

/// Has calls that would wait fail instead.
void NeverBlock(Socket socket);

/// Sends what can be sent at once. To somebody who has gone it fails, without a signal.
/// @return how many bytes; negative when it has failed
std::ptrdiff_t Send(Socket socket, const char* bytes, std::size_t size);

/// Has nobody else serve at the address of a socket that is yet to be bound, while it serves.
void ServeAlone(Socket socket);

/// Ends the connection, and closes the socket.
void Close(Socket socket);

/// Why a socket could not be bound, which is to be asked at once.
enum class BindFailure { InUse, NotAllowed, Other };
BindFailure LastBindFailure();

/// Whether a host is an address in digits, of either kind.
bool IsNumber(const std::string& host);

/// Has the signal of a write to somebody who has gone stay as it is for this process and those that
/// it starts, whatever a library does to it between construction and Restore.
class KeptSignal {
public:
    KeptSignal();
    void Restore() const;

private:
    void (*m_handler)(int);
    int m_flags;
};

} // namespace Sockets
