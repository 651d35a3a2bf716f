#include "host/program/journal/Sqlite.h"

#include <sqlite3.h>

#include <system_error>

namespace {

int PrimaryCode(int code) {
    return code & 0xFF;
}

SqliteError ErrorOf(sqlite3* database, int code) {
    std::string what = database ? sqlite3_errmsg(database) : sqlite3_errstr(code);
    const bool isSystems =
        PrimaryCode(code) == SQLITE_CANTOPEN || PrimaryCode(code) == SQLITE_IOERR;
    if (const int error = database && isSystems ? sqlite3_system_errno(database) : 0)
        what.append(": ").append(std::system_category().message(error));
    return {code, what};
}

} // namespace

SqliteError SqliteError::Damage(const std::string& what) {
    return {SQLITE_CORRUPT, what};
}

SqliteError SqliteError::Unable(const std::string& what) {
    return {SQLITE_CANTOPEN, what};
}

bool SqliteError::MeansDamage() const {
    return PrimaryCode(m_code) == SQLITE_CORRUPT || PrimaryCode(m_code) == SQLITE_NOTADB;
}

bool SqliteError::MeansLocked() const {
    return PrimaryCode(m_code) == SQLITE_BUSY;
}

void SqliteDatabase::Close::operator()(sqlite3* database) const {
    sqlite3_close(database);
}

SqliteDatabase::SqliteDatabase(const std::filesystem::path& file, bool make,
                               std::chrono::milliseconds patience) {
    sqlite3* opened = nullptr;
    const int flags = SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOMUTEX | (make ? SQLITE_OPEN_CREATE : 0);
    const int code = sqlite3_open_v2(file.u8string().c_str(), &opened, flags, nullptr);
    m_database.reset(opened); // there is one in most cases of failure, too
    if (code != SQLITE_OK)
        throw ErrorOf(opened, code);
    sqlite3_busy_timeout(opened, static_cast<int>(patience.count()));
}

void SqliteDatabase::Run(const std::string& statements) {
    const int code = sqlite3_exec(m_database.get(), statements.c_str(), nullptr, nullptr, nullptr);
    if (code != SQLITE_OK)
        throw ErrorOf(m_database.get(), code);
}

int SqliteDatabase::Changes() const {
    return sqlite3_changes(m_database.get());
}

bool SqliteDatabase::IsGone() const {
    int moved = 0;
    sqlite3_file_control(m_database.get(), nullptr, SQLITE_FCNTL_HAS_MOVED, &moved);
    return moved != 0;
}

SqliteStatement::SqliteStatement(sqlite3* database, const std::string& sql) : m_database(database) {
    sqlite3_stmt* prepared = nullptr;
    Check(sqlite3_prepare_v2(database, sql.c_str(), -1, &prepared, nullptr));
    m_statement.reset(prepared);
}

void SqliteStatement::Finalize::operator()(sqlite3_stmt* statement) const {
    sqlite3_finalize(statement);
}

bool SqliteStatement::Next() {
    const int code = sqlite3_step(m_statement.get());
    m_column = 0;
    if (code != SQLITE_ROW && code != SQLITE_DONE)
        throw ErrorOf(m_database, code);
    return code == SQLITE_ROW;
}

std::int64_t SqliteStatement::Integer() {
    return sqlite3_column_int64(m_statement.get(), m_column++);
}

double SqliteStatement::Real() {
    return sqlite3_column_double(m_statement.get(), m_column++);
}

std::string SqliteStatement::Bytes() {
    const void* const bytes = sqlite3_column_blob(m_statement.get(), m_column);
    const int size = sqlite3_column_bytes(m_statement.get(), m_column++);
    return bytes ? std::string(static_cast<const char*>(bytes), static_cast<std::size_t>(size))
                 : std::string();
}

void SqliteStatement::Reset() {
    sqlite3_reset(m_statement.get()); // tells again of an error that has been told
}

void SqliteStatement::Bind(int index, std::int64_t value) {
    Check(sqlite3_bind_int64(m_statement.get(), index, value));
}

void SqliteStatement::Bind(int index, double value) {
    Check(sqlite3_bind_double(m_statement.get(), index, value));
}

void SqliteStatement::Bind(int index, const std::filesystem::path& path) {
    const std::string bytes = path.u8string();
    Check(sqlite3_bind_blob64(m_statement.get(), index, bytes.data(), bytes.size(),
                              SQLITE_TRANSIENT));
}

void SqliteStatement::BindText(int index, std::string_view utf8) {
    Check(sqlite3_bind_text64(m_statement.get(), index, utf8.data(), utf8.size(), SQLITE_TRANSIENT,
                              SQLITE_UTF8));
}

void SqliteStatement::Check(int code) const {
    if (code != SQLITE_OK)
        throw ErrorOf(m_database, code);
}

SqliteTransaction::~SqliteTransaction() {
    if (!m_open)
        return;
    try {
        m_database.Run("ROLLBACK");
    } catch (const SqliteError&) { // some errors have rolled it back already
    }
}
