#pragma once

#include "host/program/page/PageAddress.h"

#include <set>
#include <string>

/// What a request says about where it comes from; empty is what it does not say.
struct RequestOrigin {
    std::string host;      ///< that it is for
    std::string origin;    ///< of the page that makes it
    std::string fetchSite; ///< how a browser calls the relation of the two
    std::string token;
};

/// Keeps pages of others from reading this one, and from pressing its buttons.
class RequestGuard {
public:
    explicit RequestGuard(const PageAddress& address);

    /// What forms must hand in; another one at each start.
    const std::string& Token() const { return m_token; }

    /// Whether the host is one of ours. A foreign name can be made to lead here, so that a foreign
    /// page is taken for a part of this one.
    bool IsForUs(const std::string& hostHeader) const;

    /// Whether a request comes from a form of ours.
    bool MayChange(const RequestOrigin& request) const;

private:
    std::set<std::string> m_names;
    std::string m_token;
};

/// 128 random bits, for what nobody may guess.
std::string RandomText();
