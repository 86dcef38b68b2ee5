#include "database/TimelineSchema.h"

namespace orvex::timeline_schema {

namespace {

constexpr std::size_t kApplication = 0x4F72'7678; // "Orvx"
constexpr std::size_t kVersion = 1;

// SQLite keeps the comments for whoever asks for the schema.
constexpr const char* kTables[] = {
    R"(captures (
    id INTEGER PRIMARY KEY,   -- hash of the messages and their times
    name TEXT NOT NULL,       -- file as it was given
    technology TEXT NOT NULL,
    first REAL NOT NULL,      -- earliest and latest message, seconds since 1970 UTC
    last REAL NOT NULL,
    messages INTEGER NOT NULL,
    every REAL NOT NULL,      -- seconds between samples
    fields TEXT NOT NULL,     -- patterns of the paths that were followed, one per line; empty for all
    version TEXT NOT NULL     -- of the decoder
))",
    R"(paths (
    id INTEGER PRIMARY KEY,   -- hash of path and key
    path TEXT NOT NULL,       -- as in the display tree, with * for each place in a list
    key TEXT NOT NULL,        -- what tells the elements of the lists apart
    UNIQUE (path, key)
))",
    R"(samples (
    path INTEGER NOT NULL REFERENCES paths,
    capture INTEGER NOT NULL REFERENCES captures,
    n INTEGER NOT NULL,       -- counts the looks at the display, in the order of the capture
    time REAL NOT NULL,       -- seconds since 1970 UTC
    text TEXT,                -- NULL: no longer shown
    number REAL,              -- NULL unless the text is a quantity
    unit TEXT,
    PRIMARY KEY (path, capture, n)
) WITHOUT ROWID)",
};

constexpr const char* kView = R"(timeline AS
SELECT c.id AS capture, c.name, c.technology, s.n,
    strftime('%Y-%m-%dT%H:%M:%fZ', s.time, 'unixepoch') AS time, s.time AS seconds,
    p.path, p.key, s.text, s.number, s.unit
FROM samples AS s JOIN captures AS c ON c.id = s.capture JOIN paths AS p ON p.id = s.path)";

} // namespace

bool makeTables(SqliteConnection& connection, const std::string& schema)
{
    for (const char* table : kTables)
        connection.execute("CREATE TABLE " + schema + "." + table);
    return connection.isGood();
}

bool finish(SqliteConnection& connection, const std::string& schema)
{
    return connection.execute("CREATE VIEW " + schema + "." + kView)
        && connection.execute("PRAGMA " + schema + ".application_id = " + std::to_string(kApplication))
        && connection.execute("PRAGMA " + schema + ".user_version = " + std::to_string(kVersion));
}

bool isEmpty(SqliteConnection& connection, const std::string& schema)
{
    return connection.count("SELECT count(*) FROM " + schema + ".sqlite_schema") == 0 && connection.isGood();
}

std::string faultOf(SqliteConnection& connection, const std::string& schema)
{
    const std::size_t application = connection.count("PRAGMA " + schema + ".application_id");
    const std::size_t version = connection.count("PRAGMA " + schema + ".user_version");
    if (!connection.isGood())
        return connection.error();
    if (application != kApplication)
        return "is not a database of timelines";
    if (version != kVersion)
        return "has version " + std::to_string(version) + " of the tables; this orvex-decode knows version "
            + std::to_string(kVersion);
    return {};
}

} // namespace orvex::timeline_schema
