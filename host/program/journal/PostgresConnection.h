#pragma once

#include "host/program/journal/Journal.h"

#include <functional>
#include <memory>
#include <pqxx/pqxx>

/// A connection to the database of a queue, for one thread. After an error it is made anew with
/// the next statement, though not more often than once a second: until then the error stays. All
/// throw JournalError.
class PostgresConnection {
public:
    using Values = std::vector<std::optional<std::string>>; ///< of a statement; nothing is NULL

    /// @param need what becomes of a database that has no queue yet
    /// @param clock gives an expression for the time of a statement, in place of now(); or null
    PostgresConnection(std::string url, JournalNeed need, std::function<std::string()> clock)
        : m_url(std::move(url)), m_need(need), m_clock(std::move(clock)) {}

    /// Connects where that has not been done.
    /// @param fault receives why that cannot be done
    /// @return whether it is connected
    bool EnsureOpen(Fault& fault);

    /// Runs one statement, which is a transaction of its own.
    /// @param sql has a $1, $2 … for each value
    template <typename... Each>
    pqxx::result Run(const std::string& sql, const Each&... values) {
        return RunWith(sql, {ValueOf(values)...});
    }

    /// How often others have said that something is new. Asks nobody: what they say comes by
    /// itself.
    std::uint64_t News();

private:
    pqxx::result RunWith(const std::string& sql, const Values& values);
    pqxx::connection& Connection();
    bool IsReady(Fault& fault);
    Fault WhyNotConnected(const std::string& options, const std::string& error) const;
    [[noreturn]] void GiveUp(const std::string& error);
    std::string WithClock(std::string sql) const;

    static std::optional<std::string> ValueOf(const std::string& utf8);
    static std::optional<std::string> ValueOf(const char* utf8) { return utf8; }
    static std::optional<std::string> ValueOf(const wxString& text) {
        return ValueOf(text.utf8_string());
    }
    static std::optional<std::string> ValueOf(bool value) { return value ? "true" : "false"; }
    static std::optional<std::string> ValueOf(int value) { return std::to_string(value); }
    static std::optional<std::string> ValueOf(std::int64_t value) { return std::to_string(value); }
    static std::optional<std::string> ValueOf(double value) { return pqxx::to_string(value); }
    /// In microseconds, as TimeOf has it; NULL for none.
    static std::optional<std::string> ValueOf(JournalTime time);
    template <typename T>
    static std::optional<std::string> ValueOf(const std::optional<T>& value) {
        return value ? ValueOf(*value) : std::nullopt;
    }

    const std::string m_url; ///< with a password: not for texts
    const JournalNeed m_need;
    const std::function<std::string()> m_clock;
    std::unique_ptr<pqxx::connection> m_connection;      ///< null after an error
    std::unique_ptr<pqxx::notification_receiver> m_bell; ///< of the connection
    std::uint64_t m_news = 1;
    std::optional<Fault> m_fault; ///< why it could not be connected
    std::chrono::steady_clock::time_point m_tried;
};
