#pragma once

#include "standins/shared/Descriptor.h"
#include "standins/shared/Failure.h"

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace standins {

/// What a message tells.
enum class MessageKind : char {
    Alive = 'a',   ///< the sender is at work
    Done = 'd',    ///< the work is done; the text and the attachment are its result
    Failed = 'f',  ///< the work failed; the text says why
    Job = 'j',     ///< work to be done, in the text and the attachment
    Note = 'n',    ///< the text is for the log
    Part = 'p',    ///< a part of the result, ahead of it
    Ready = 'r',   ///< the sender can take work
    Started = 's', ///< the work has begun in a process of its own; the text is its number
};

struct Message {
    MessageKind kind = MessageKind::Failed;
    std::string text; ///< UTF-8
    Descriptor attachment;
    Fault fault = Fault::Document; ///< what a failure is to be blamed on
};

/// One end of a connection between the server and the supervisor of an engine run. Messages arrive
/// whole. Either side learns at once when the other is gone, however it went.
class Channel {
public:
    explicit Channel(Descriptor socket) : m_socket(std::move(socket)) {}

    /// @return two ends that talk to each other, or nothing when the system has no more descriptors
    static std::optional<std::pair<Channel, Channel>> MakePair();

    int Socket() const { return m_socket.Get(); }

    /// @param attachment a descriptor that the receiver gets a copy of, or -1
    /// @return false when the other end is gone
    bool Send(MessageKind kind, const std::string& text = {}, int attachment = -1) const;
    bool Send(const Failure& failure) const;

    /// Waits for a message.
    /// @return nothing when the other end is gone
    std::optional<Message> Receive() const;

private:
    bool SendBytes(std::string bytes, int attachment) const;

    Descriptor m_socket;
};

// Words as one text: each ends with a zero, which no argument of a program can hold.

std::string JoinWords(const std::vector<std::string>& words);
std::vector<std::string> SplitWords(const std::string& text);

} // namespace standins
