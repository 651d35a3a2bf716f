#pragma once

#include "host/program/journal/PathMap.h"
#include "host/program/journal/PostgresConnection.h"

/// A row of a result, read from the left: a column with each call.
class PostgresRow {
public:
    PostgresRow(const pqxx::row& row, const PathMap& map) : m_row(row), m_map(map) {}

    std::int64_t Integer() { return Next().as<std::int64_t>(0); }
    double Real() { return Next().as<double>(0.0); }
    std::string Bytes() { return Next().as<std::string>(""); }
    wxString Text() { return wxString::FromUTF8(Bytes()); }
    std::filesystem::path Path();
    JournalTime Time(); ///< as MicrosecondsOf has it

private:
    pqxx::field Next() { return m_row[m_column++]; }

    pqxx::row m_row;
    const PathMap& m_map;
    pqxx::row::size_type m_column = 0;
};

/// A path as the table has it: as all machines call it, and as people can read it.
/// Backslashes are doubled; of one that is no UTF-8, the bytes that are no ASCII stand as \x and
/// two digits.
std::string PathText(const std::filesystem::path& path, const PathMap& map);

/// The columns of job that ReadJobs reads.
extern const char* const PostgresJobColumns;

std::vector<Job> ReadJobs(const pqxx::result& rows, const PathMap& map);

/// Stores what has changed of a job.
/// @return false when it is gone, or claimed since
bool StoreJob(PostgresConnection& connection, const PathMap& map, const Job& job);
