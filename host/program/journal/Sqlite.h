#pragma once

#include "host/program/journal/Journal.h"

#include <cstdint>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

/// SQLite has failed at something.
class SqliteError : public JournalError {
public:
    /// @param code SQLite's
    SqliteError(int code, const std::string& what) : JournalError(what), m_code(code) {}

    /// Found by somebody else than SQLite.
    static SqliteError Damage(const std::string& what);
    static SqliteError Unable(const std::string& what);

    /// The file is damaged, or no database.
    bool MeansDamage() const;
    /// Another program has had the file for itself for too long.
    bool MeansLocked() const;

private:
    int m_code;
};

/// A file of SQLite's that is open, for one thread. All throw SqliteError.
class SqliteDatabase {
public:
    /// @param make the file when there is none
    /// @param patience how long to wait for another program
    SqliteDatabase(const std::filesystem::path& file, bool make,
                   std::chrono::milliseconds patience);

    /// Runs statements that have no result.
    void Run(const std::string& statements);

    /// How many rows the last statement has changed.
    int Changes() const;

    /// Whether there is no file any more where this one was, or another one. Not known everywhere:
    /// some systems keep a file that is open from being removed.
    bool IsGone() const;

private:
    friend class SqliteStatement;

    struct Close {
        void operator()(sqlite3* database) const;
    };

    std::unique_ptr<sqlite3, Close> m_database;
};

/// A statement with its values, and the row of its result that it stands at.
class SqliteStatement {
public:
    /// @param sql has a ?1, ?2 … for each value
    template <typename... Values>
    SqliteStatement(SqliteDatabase& database, const std::string& sql, const Values&... values)
        : SqliteStatement(database.m_database.get(), sql) {
        Begin(values...);
    }

    /// Begins it anew, with other values.
    template <typename... Values>
    void Begin(const Values&... values) {
        Reset();
        int index = 0;
        (Bind(++index, values), ...);
    }

    /// Goes to the next row.
    /// @return false when there is none
    bool Next();

    /// Runs a statement that has no result.
    void Run() {
        while (Next()) {
        }
    }

    // The columns of the row, from the left, one with each call.
    std::int64_t Integer();
    double Real();
    std::string Bytes();
    wxString Text() { return wxString::FromUTF8(Bytes()); }
    std::filesystem::path Path() { return std::filesystem::u8path(Bytes()); }
    JournalTime Time() { return JournalTime(std::chrono::milliseconds(Integer())); }

private:
    SqliteStatement(sqlite3* database, const std::string& sql);

    void Reset();
    void Bind(int index, std::int64_t value);
    void Bind(int index, std::uint64_t value) { Bind(index, static_cast<std::int64_t>(value)); }
    void Bind(int index, int value) { Bind(index, static_cast<std::int64_t>(value)); }
    void Bind(int index, bool value) { Bind(index, static_cast<std::int64_t>(value)); }
    void Bind(int index, double value);
    void Bind(int index, const char* text) { BindText(index, text); }
    void Bind(int index, const wxString& text) { BindText(index, text.utf8_string()); }
    void Bind(int index, const std::filesystem::path& path); ///< as bytes, which may be no text
    void Bind(int index, JournalTime time) { Bind(index, MillisecondsOf(time)); }
    void BindText(int index, std::string_view utf8);
    void Check(int code) const;

    static std::int64_t MillisecondsOf(JournalTime time) {
        return std::chrono::floor<std::chrono::milliseconds>(time.time_since_epoch()).count();
    }

    struct Finalize {
        void operator()(sqlite3_stmt* statement) const;
    };

    sqlite3* m_database;
    std::unique_ptr<sqlite3_stmt, Finalize> m_statement;
    int m_column = 0;
};

/// All that is written while it lives comes into the file at once, with Commit, or not at all.
class SqliteTransaction {
public:
    explicit SqliteTransaction(SqliteDatabase& database) : m_database(database) {
        m_database.Run("BEGIN IMMEDIATE");
    }
    ~SqliteTransaction();
    SqliteTransaction(const SqliteTransaction&) = delete;
    SqliteTransaction& operator=(const SqliteTransaction&) = delete;

    void Commit() {
        m_database.Run("COMMIT");
        m_open = false;
    }

private:
    SqliteDatabase& m_database;
    bool m_open = true;
};
