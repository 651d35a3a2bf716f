#pragma once

#include "host/program/base/Fault.h"

#include <pqxx/pqxx>

/// Sees to it that a database has a queue's tables, in a form that this version knows. They lie in
/// the connection's default schema. Throws pqxx's errors.
/// @param make the tables where there are none
/// @param fault receives why they are not there
bool EnsureSchema(pqxx::connection& connection, bool make, Fault& fault);
