#include "host/program/journal/PostgresConnection.h"

#include "host/program/journal/PostgresAddress.h"
#include "host/program/journal/PostgresSchema.h"

#include <wx/intl.h>

#include <glib.h>

using namespace std::chrono_literals;
using std::chrono::steady_clock;

namespace {

/// How long to wait before a server is tried again that could not be reached.
constexpr auto Pause = 1s;

/// No statement hangs for longer; nobody else keeps rows for himself for as long either. All of
/// them are short: compiling them would take longer.
constexpr const char* Settings = "SET statement_timeout = '10s'; SET lock_timeout = '8s'; "
                                 "SET idle_in_transaction_session_timeout = '10s'; "
                                 "SET client_min_messages = warning; SET jit = off";

/// The server's or the library's words, in one line.
wxString OneLine(const std::string& text) {
    wxString line = wxString::FromUTF8(text);
    line.Trim();
    line.Replace("\n", "; ");
    line.Replace("\t", " ");
    return line;
}

/// Hears what other connections tell.
class Bell : public pqxx::notification_receiver {
public:
    Bell(pqxx::connection& connection, std::uint64_t& news)
        : notification_receiver(connection, "quillon"), m_own(connection.backendpid()),
          m_news(news) {}

    void operator()(const std::string& /*payload*/, int sender) override {
        if (sender != m_own)
            ++m_news;
    }

private:
    int m_own;
    std::uint64_t& m_news;
};

} // namespace

bool PostgresConnection::EnsureOpen(Fault& fault) {
    if (m_connection && m_connection->is_open())
        return true;
    m_bell.reset();
    m_connection.reset();
    if (!m_fault || steady_clock::now() - m_tried >= Pause) {
        m_fault.reset();
        Fault why;
        if (IsReady(why))
            return true;
        m_bell.reset();
        m_connection.reset();
        m_fault = why;
        m_tried = steady_clock::now();
    }
    fault = *m_fault;
    return false;
}

bool PostgresConnection::IsReady(Fault& fault) {
    const std::string options = ConnectionOptions(m_url, fault);
    if (options.empty())
        return false;
    try {
        m_connection = std::make_unique<pqxx::connection>(options);
    } catch (const pqxx::pqxx_exception& error) {
        fault = WhyNotConnected(options, error.base().what());
        return false;
    }
    try {
        pqxx::nontransaction(*m_connection).exec(Settings);
        m_bell = std::make_unique<Bell>(*m_connection, m_news);
        ++m_news; // what was told before was missed
        return EnsureSchema(*m_connection, m_need == JournalNeed::Make, fault);
    } catch (const pqxx::pqxx_exception& error) {
        fault = {
            wxString::Format(_("the queue's database fails: %s"), OneLine(error.base().what())),
            Blame::Machine};
        return false;
    }
}

Fault PostgresConnection::WhyNotConnected(const std::string& options,
                                          const std::string& error) const {
    if (AnswersAt(options))
        return {wxString::Format(_("the queue's server does not let this program in: %s"),
                                 OneLine(error)),
                Blame::Usage, ConversionFailed,
                _("Check the user, the password and the database in the queue's address, and the "
                  "server's pg_hba.conf")};
    return {wxString::Format(_("the queue's server cannot be reached: %s"), OneLine(error)),
            Blame::Machine, ConversionFailed,
            _("Check that PostgreSQL runs there, and that this machine can reach it")};
}

pqxx::connection& PostgresConnection::Connection() {
    Fault fault;
    if (!EnsureOpen(fault))
        throw JournalError(fault.Text().utf8_string());
    return *m_connection;
}

pqxx::result PostgresConnection::RunWith(const std::string& sql, const Values& values) {
    pqxx::connection& connection = Connection();
    std::vector<const char*> parameters;
    parameters.reserve(values.size());
    for (const std::optional<std::string>& value : values)
        parameters.push_back(value ? value->c_str() : nullptr);
    try {
        return pqxx::nontransaction(connection)
            .exec_params(WithClock(sql), pqxx::prepare::make_dynamic_params(parameters));
    } catch (const pqxx::pqxx_exception& error) {
        GiveUp(error.base().what());
    }
}

std::uint64_t PostgresConnection::News() {
    pqxx::connection& connection = Connection();
    try {
        connection.get_notifs();
    } catch (const pqxx::pqxx_exception& error) {
        GiveUp(error.base().what());
    }
    return m_news;
}

void PostgresConnection::GiveUp(const std::string& error) {
    const std::string text =
        wxString::Format(_("the queue's database fails: %s"), OneLine(error)).utf8_string();
    m_bell.reset();
    m_connection.reset();
    throw JournalError(text);
}

std::string PostgresConnection::WithClock(std::string sql) const {
    if (!m_clock)
        return sql;
    static const std::string Standard = "now()";
    const std::string clock = m_clock();
    for (std::size_t at = 0; (at = sql.find(Standard, at)) != std::string::npos; at += clock.size())
        sql.replace(at, Standard.size(), clock);
    return sql;
}

/// What is no UTF-8 is shown so: the server would refuse all of it.
std::optional<std::string> PostgresConnection::ValueOf(const std::string& utf8) {
    const std::unique_ptr<char, void (*)(void*)> valid(
        g_utf8_make_valid(utf8.data(), static_cast<gssize>(utf8.size())), g_free);
    return valid.get();
}

std::optional<std::string> PostgresConnection::ValueOf(JournalTime time) {
    if (time == JournalTime())
        return std::nullopt;
    return std::to_string(
        std::chrono::floor<std::chrono::microseconds>(time.time_since_epoch()).count());
}
