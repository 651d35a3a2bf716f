#include "host/program/page/RequestGuard.h"

#include "host/program/system/Sockets.h"

#include <wx/utils.h>

#include <random>

namespace {

/// Takes as long for any text, so that nobody learns by the clock how much of it was right.
bool AreSame(const std::string& secret, const std::string& text) {
    unsigned char difference = secret.size() == text.size() ? 0 : 1;
    for (std::size_t i = 0; i < secret.size(); ++i)
        difference |= static_cast<unsigned char>(secret[i] ^ (i < text.size() ? text[i] : '\0'));
    return difference == 0;
}

bool IsSameOrigin(const RequestOrigin& request) {
    if (!request.fetchSite.empty()) // a browser's own word, whatever a proxy does to the others
        return request.fetchSite == "same-origin";
    return request.origin.empty() || request.origin == "http://" + request.host ||
           request.origin == "https://" + request.host;
}

} // namespace

std::string RandomText() {
    constexpr const char* Digits = "0123456789abcdef";
    std::random_device random; // the system's
    std::string text;
    for (int word = 0; word < 4; ++word) {
        std::uint32_t bits = random();
        for (int digit = 0; digit < 8; ++digit, bits >>= 4)
            text += Digits[bits & 0xF];
    }
    return text;
}

RequestGuard::RequestGuard(const PageAddress& address)
    : m_names{"localhost", address.host, wxGetHostName().Lower().utf8_string()},
      m_token(RandomText()) {
    if (!address.IsLoopback()) // asks the network, which may take its time
        m_names.insert(wxGetFullHostName().Lower().utf8_string());
}

bool RequestGuard::IsForUs(const std::string& hostHeader) const {
    const std::optional<std::string> host = HostIn(hostHeader);
    // A number cannot be made to lead elsewhere.
    return host && (Sockets::IsNumber(*host) || m_names.count(*host) > 0);
}

bool RequestGuard::MayChange(const RequestOrigin& request) const {
    return IsSameOrigin(request) && AreSame(m_token, request.token);
}
