#include "host/program/page/PageAddress.h"

#include "host/program/system/Sockets.h"

#include <wx/intl.h>

#include <algorithm>
#include <cctype>
#include <charconv>

namespace {

struct HostAndPort {
    std::string host;
    std::string port; ///< empty when there is none
};

std::optional<HostAndPort> Split(const std::string& text) {
    const bool inBrackets = !text.empty() && text.front() == '[';
    const std::size_t end = inBrackets ? text.find(']') : text.find(':');
    if (inBrackets && end == std::string::npos)
        return std::nullopt;
    HostAndPort parts{inBrackets ? text.substr(1, end - 1) : text.substr(0, end), {}};
    const std::size_t colon = inBrackets ? end + 1 : end;
    if (colon < text.size()) {
        if (text[colon] != ':')
            return std::nullopt;
        parts.port = text.substr(colon + 1);
    }
    return parts;
}

std::string LowerCase(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

std::optional<int> PortOf(const std::string& text) {
    std::uint16_t port = 0;
    const char* const end = text.data() + text.size();
    const auto [rest, error] = std::from_chars(text.data(), end, port);
    return error == std::errc() && rest == end ? std::optional<int>(port) : std::nullopt;
}

} // namespace

std::string PageAddress::Text() const {
    const bool needsBrackets = host.find(':') != std::string::npos;
    return (needsBrackets ? '[' + host + ']' : host) + ':' + std::to_string(port);
}

bool PageAddress::IsLoopback() const {
    return host == "localhost" || host == "::1" ||
           (Sockets::IsNumber(host) && host.rfind("127.", 0) == 0);
}

std::optional<PageAddress> ReadPageAddress(const std::string& text, Fault& fault) {
    const std::optional<HostAndPort> parts = Split(text);
    const std::optional<int> port = parts ? PortOf(parts->port) : std::nullopt;
    if (port && !parts->host.empty() && parts->host.find_first_of(" \t/?#@") == std::string::npos)
        return PageAddress{LowerCase(parts->host), *port};
    fault = {wxString::Format(_("\"%s\" is no address for a page"), wxString::FromUTF8(text)),
             Blame::Usage, ConversionFailed,
             _("It is HOST:PORT, for instance 127.0.0.1:9188 or [::1]:9188")};
    return std::nullopt;
}

std::optional<std::string> HostIn(const std::string& header) {
    const std::optional<HostAndPort> parts = Split(header);
    if (!parts || parts->host.empty() || (!parts->port.empty() && !PortOf(parts->port)))
        return std::nullopt;
    return LowerCase(parts->host);
}
