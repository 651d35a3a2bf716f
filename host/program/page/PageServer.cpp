#include "host/program/page/PageServer.h"

#include "common/WQServices.h"
#include "host/program/page/Health.h"
#include "host/program/page/Metrics.h"
#include "host/program/page/Page.h"
#include "host/program/page/RequestGuard.h"
#include "host/program/page/WebServer.h"

#include <wx/intl.h>

#include <algorithm>
#include <charconv>
#include <nlohmann/json.hpp>

using httplib::Request;
using httplib::Response;

namespace {

constexpr const char* Plain = "text/plain; charset=utf-8";
constexpr const char* Policy = "Content-Security-Policy";

void Refuse(Response& response, int status, const wxString& why) {
    response.status = status;
    response.set_content(why.utf8_string() + '\n', Plain);
}

std::optional<wxString> Parameter(const Request& request, const char* name) {
    if (!request.has_param(name))
        return std::nullopt;
    return wxString::FromUTF8(request.get_param_value(name));
}

/// The number of the document that a form names; 0 is nobody's.
std::int64_t JobIn(const Request& request) {
    const std::string text = request.get_param_value("id");
    std::int64_t id = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), id);
    return error == std::errc() && end == text.data() + text.size() ? id : 0;
}

void LogException(const std::exception_ptr& thrown) {
    try {
        std::rethrow_exception(thrown);
    } catch (const std::exception& error) {
        SetLevelAndGetLogger(LevelError, __FILE__, __func__, __LINE__)
            << "A request for the page has failed: " << error.what();
    }
}

class Server : public PageServer {
public:
    Server(const PageAddress& address, JournalOpener journal, const StatusBoard& board,
           std::function<void()> onRequest)
        : m_guard(address), m_journal(std::move(journal)), m_board(board),
          m_onRequest(std::move(onRequest)) {
        SetRoutes();
    }

    std::optional<Fault> Begin(PageAddress address) {
        std::optional<Fault> fault = m_web.Bind(address);
        if (fault)
            return fault;
        m_address = address.Text();
        m_web.Serve();
        return std::nullopt;
    }

    std::string Address() const override { return m_address; }

    void Count(const wxString& folder, const char* state, int code, const wxString& application,
               double seconds) override {
        m_metrics.Count(folder, state, code, application, seconds);
    }
    void CountRetry(const wxString& folder) override { m_metrics.CountRetry(folder); }

private:
    void SetRoutes();
    const Texts& TextsFor(const Request& request) const;
    void GetPage(const Request& request, Response& response);
    void GetHealth(const Request& request, Response& response);
    void GetMetrics(const Request& request, Response& response);
    void Retry(const Request& request, Response& response);
    void SetPaused(const Request& request, Response& response, bool paused);
    void Change(const Request& request, Response& response,
                const std::function<void(Journal&)>& change);

    std::string m_address;
    TextsOfLanguages m_languages;
    RequestGuard m_guard;
    JournalAccess m_journal;
    const StatusBoard& m_board;
    const std::function<void()> m_onRequest;
    Metrics m_metrics;
    WebServer m_web; ///< ends before what its threads use
};

void Server::SetRoutes() {
    m_web.set_default_headers({{"X-Content-Type-Options", "nosniff"},
                               {"X-Frame-Options", "DENY"},
                               {"Referrer-Policy", "same-origin"},
                               {"Cross-Origin-Resource-Policy", "same-origin"},
                               {"Cache-Control", "no-store"},
                               {Policy, "default-src 'none'; frame-ancestors 'none'"}});
    m_web.set_pre_routing_handler([this](const Request& request, Response& response) {
        if (m_guard.IsForUs(request.get_header_value("Host")))
            return httplib::Server::HandlerResponse::Unhandled;
        Refuse(response, 421,
               TextsFor(request)(wxTRANSLATE("Nothing is served under this name. Use the address "
                                             "that the configuration names.")));
        return httplib::Server::HandlerResponse::Handled;
    });
    m_web.set_exception_handler(
        [](const Request&, Response& response, const std::exception_ptr& thrown) {
            LogException(thrown);
            Refuse(response, 500, "internal error");
        });
    m_web.set_error_handler([](const Request&, Response& response) {
        if (response.body.empty())
            response.set_content(std::to_string(response.status) + '\n', Plain);
    });
    m_web.Get("/", [this](const auto& request, auto& response) { GetPage(request, response); });
    m_web.Get("/healthz",
              [this](const auto& request, auto& response) { GetHealth(request, response); });
    m_web.Get("/metrics",
              [this](const auto& request, auto& response) { GetMetrics(request, response); });
    m_web.Post("/retry", [this](const auto& request, auto& response) { Retry(request, response); });
    m_web.Post("/pause",
               [this](const auto& request, auto& response) { SetPaused(request, response, true); });
    m_web.Post("/resume", [this](const auto& request, auto& response) {
        SetPaused(request, response, false);
    });
}

const Texts& Server::TextsFor(const Request& request) const {
    const std::optional<wxString> chosen = Parameter(request, "lang");
    const Texts* const texts = chosen ? m_languages.Find(*chosen) : nullptr;
    return texts ? *texts : m_languages.Choose(request.get_header_value("Accept-Language"));
}

void Server::GetPage(const Request& request, Response& response) {
    const std::string nonce = RandomText();
    const WatchStatus status = m_board.Get();
    const JournalExtract journal = m_journal.Read();
    const PageContent content{
        status,          journal, TextsFor(request), m_languages, request.has_param("lang"),
        m_guard.Token(), nonce};
    response.headers.erase(Policy);
    response.set_header(Policy, "default-src 'none'; style-src 'nonce-" + nonce +
                                    "'; script-src 'nonce-" + nonce +
                                    "'; connect-src 'self'; form-action 'self'; base-uri 'none'; "
                                    "frame-ancestors 'none'");
    response.set_header("Vary", "Accept-Language");
    response.set_content(WritePage(content), "text/html; charset=utf-8");
}

void Server::GetHealth(const Request& request, Response& response) {
    const std::vector<wxString> reasons = ReasonsOfIllness(
        m_board.Get(), m_journal.Read(), std::chrono::steady_clock::now(), TextsFor(request));
    response.status = reasons.empty() ? 200 : 503;
    if (request.has_param("json") ||
        request.get_header_value("Accept").find("application/json") != std::string::npos) {
        nlohmann::ordered_json record = {{"ok", reasons.empty()},
                                         {"reasons", nlohmann::ordered_json::array()}};
        for (const wxString& reason : reasons)
            record["reasons"].push_back(reason.utf8_string());
        response.set_content(record.dump() + '\n', "application/json");
        return;
    }
    wxString text;
    for (const wxString& reason : reasons)
        text << reason << '\n';
    response.set_content(reasons.empty() ? "ok\n" : text.utf8_string(), Plain);
}

void Server::GetMetrics(const Request&, Response& response) {
    response.set_content(
        m_metrics.Text(m_board.Get(), m_journal.Read(), std::chrono::system_clock::now()),
        "text/plain; version=0.0.4; charset=utf-8");
}

void Server::Retry(const Request& request, Response& response) {
    Change(request, response, [&request](Journal& journal) {
        if (request.has_param("all"))
            RetryFailed(journal, Parameter(request, "folder"));
        else
            journal.Retry(JobIn(request));
    });
}

void Server::SetPaused(const Request& request, Response& response, bool paused) {
    const wxString folder = Parameter(request, "folder").value_or(wxString());
    const std::vector<FolderStatus> folders = m_board.Get().folders;
    const bool isKnown = folder.empty() || std::any_of(folders.begin(), folders.end(),
                                                       [&folder](const FolderStatus& each) {
                                                           return each.configuration.name == folder;
                                                       });
    if (!isKnown)
        return Refuse(response, 404,
                      TextsFor(request)(wxTRANSLATE("There is no such folder any more.")));
    Change(request, response,
           [&folder, paused](Journal& journal) { journal.SetPaused(folder, paused); });
}

void Server::Change(const Request& request, Response& response,
                    const std::function<void(Journal&)>& change) {
    if (!m_guard.MayChange({request.get_header_value("Host"), request.get_header_value("Origin"),
                            request.get_header_value("Sec-Fetch-Site"),
                            request.get_param_value("token")}))
        return Refuse(response, 403,
                      TextsFor(request)(wxTRANSLATE("This form is out of date, or not of this "
                                                    "page. Load the page anew and try again.")));
    if (const std::optional<Fault> fault = m_journal.Change(change))
        return Refuse(response, 503, fault->Text());
    m_onRequest();
    const std::optional<wxString> chosen = Parameter(request, "lang");
    const Texts* const texts = chosen ? m_languages.Find(*chosen) : nullptr;
    response.set_redirect(texts ? "/?lang=" + texts->Language().utf8_string() : "/", 303);
}

} // namespace

std::unique_ptr<PageServer> PageServer::Start(const std::string& address, JournalOpener journal,
                                              const StatusBoard& board,
                                              std::function<void()> onRequest, Fault& fault) {
    const std::optional<PageAddress> place = ReadPageAddress(address, fault);
    if (!place)
        return nullptr;
    auto server = std::make_unique<Server>(*place, std::move(journal), board, std::move(onRequest));
    if (const std::optional<Fault> why = server->Begin(*place)) {
        fault = *why;
        return nullptr;
    }
    SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
        << "The page is at http://" << server->Address().c_str() << "/.";
    if (!place->IsLoopback())
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Others can reach the page at " << server->Address().c_str()
            << ", and it asks for no password. Have it serve at 127.0.0.1, with a proxy in front "
               "that does.";
    return server;
}
