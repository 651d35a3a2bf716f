#include "standins/shared/Channel.h"

#include <sys/socket.h>
#include <sys/uio.h>

#include <array>
#include <cerrno>
#include <cstring>

namespace standins {

namespace {

constexpr std::size_t LongestText = std::size_t{32} << 10; // paths may have 4 KiB each

/// What stands in front of a message's text.
std::string Head(MessageKind kind, Fault fault) {
    return {static_cast<char>(kind), static_cast<char>(fault)};
}
constexpr std::size_t HeadSize = 2;

/// The room that sendmsg and recvmsg want for one descriptor.
struct Ancillary {
    alignas(cmsghdr) std::array<char, CMSG_SPACE(sizeof(int))> bytes{};
};

Descriptor TakeAttachment(msghdr& header) {
    const cmsghdr* control = CMSG_FIRSTHDR(&header);
    if (!control || control->cmsg_level != SOL_SOCKET || control->cmsg_type != SCM_RIGHTS)
        return Descriptor();
    int attachment = -1;
    std::memcpy(&attachment, CMSG_DATA(control), sizeof attachment);
    return Descriptor(attachment);
}

} // namespace

std::optional<std::pair<Channel, Channel>> Channel::MakePair() {
    std::array<int, 2> ends{};
    if (socketpair(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC, 0, ends.data()) != 0)
        return std::nullopt;
    return std::make_pair(Channel(Descriptor(ends[0])), Channel(Descriptor(ends[1])));
}

bool Channel::Send(MessageKind kind, const std::string& text, int attachment) const {
    return SendBytes(Head(kind, Fault::Document) + text.substr(0, LongestText), attachment);
}

bool Channel::Send(const Failure& failure) const {
    return SendBytes(
        Head(MessageKind::Failed, failure.fault) + failure.reason.substr(0, LongestText), -1);
}

bool Channel::SendBytes(std::string bytes, int attachment) const {
    iovec part{bytes.data(), bytes.size()};
    Ancillary ancillary;
    msghdr header{};
    header.msg_iov = &part;
    header.msg_iovlen = 1;
    if (attachment >= 0) {
        header.msg_control = ancillary.bytes.data();
        header.msg_controllen = ancillary.bytes.size();
        cmsghdr* control = CMSG_FIRSTHDR(&header);
        control->cmsg_level = SOL_SOCKET;
        control->cmsg_type = SCM_RIGHTS;
        control->cmsg_len = CMSG_LEN(sizeof attachment);
        std::memcpy(CMSG_DATA(control), &attachment, sizeof attachment);
    }
    ssize_t sent = -1;
    do {
        sent = sendmsg(m_socket.Get(), &header, MSG_NOSIGNAL);
    } while (sent < 0 && errno == EINTR);
    return sent == static_cast<ssize_t>(bytes.size());
}

std::optional<Message> Channel::Receive() const {
    std::array<char, HeadSize + LongestText> bytes{};
    iovec part{bytes.data(), bytes.size()};
    Ancillary ancillary;
    msghdr header{};
    header.msg_iov = &part;
    header.msg_iovlen = 1;
    header.msg_control = ancillary.bytes.data();
    header.msg_controllen = ancillary.bytes.size();
    ssize_t received = -1;
    do {
        received = recvmsg(m_socket.Get(), &header, MSG_CMSG_CLOEXEC);
    } while (received < 0 && errno == EINTR);
    if (received < static_cast<ssize_t>(HeadSize))
        return std::nullopt;
    return Message{
        static_cast<MessageKind>(bytes[0]),
        std::string(bytes.data() + HeadSize, static_cast<std::size_t>(received) - HeadSize),
        TakeAttachment(header), static_cast<Fault>(bytes[1])};
}

std::string JoinWords(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words)
        text.append(word).push_back('\0');
    return text;
}

std::vector<std::string> SplitWords(const std::string& text) {
    std::vector<std::string> words;
    for (std::size_t start = 0; start < text.size();) {
        const std::size_t end = text.find('\0', start);
        words.push_back(text.substr(start, end - start));
        start = end == std::string::npos ? text.size() : end + 1;
    }
    return words;
}

} // namespace standins
