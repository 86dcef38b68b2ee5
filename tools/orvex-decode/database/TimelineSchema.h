#pragma once

#include "database/SqliteConnection.h"

#include <string>

// The tables of timelines. Identities are hashes of what they identify, so that databases made apart can be
// merged row by row; a change of tables or hashes needs another version.
namespace orvex::timeline_schema {

// Makes the tables of a connection's schema.
bool makeTables(SqliteConnection& connection, const std::string& schema);
// Makes the view and marks the database.
bool finish(SqliteConnection& connection, const std::string& schema);

// True if the schema has no tables at all.
bool isEmpty(SqliteConnection& connection, const std::string& schema);
// Why the schema does not hold timelines; empty if it does.
std::string faultOf(SqliteConnection& connection, const std::string& schema);

} // namespace orvex::timeline_schema
