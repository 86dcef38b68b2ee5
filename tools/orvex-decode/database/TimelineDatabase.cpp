#include "database/TimelineDatabase.h"

#include "database/TimelineSchema.h"

#include "OutputFile.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string_view>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvex {

namespace {

using Taken = TimelineDatabase::Taken;

// What a capture has in common with itself when another run gives the same samples.
constexpr const char* kChoose = R"(
CREATE TEMP TABLE chosen AS SELECT id FROM main.captures AS new WHERE NOT EXISTS (
    SELECT 1 FROM target.captures AS old WHERE old.id = new.id AND old.technology = new.technology
    AND old.every = new.every AND old.fields = new.fields AND old.version = new.version))";

constexpr const char* kReplace = R"(
DELETE FROM target.samples WHERE path IN (SELECT id FROM target.paths) AND capture IN temp.chosen;
DELETE FROM target.captures WHERE id IN temp.chosen)";

// Samples are added in the order of their table: otherwise SQLite goes back to a page for nearly every row.
constexpr const char* kAdd = R"(
INSERT OR IGNORE INTO target.paths SELECT * FROM main.paths;
INSERT INTO target.samples SELECT * FROM main.samples WHERE capture IN temp.chosen ORDER BY path, capture, n;
INSERT INTO target.captures SELECT * FROM main.captures WHERE id IN temp.chosen)";

// Without statistics, SQLite reads the whole table for a capture and a whole capture for one of its rows.
constexpr const char* kAnalyze = "PRAGMA analysis_limit = 1000; ANALYZE target";

std::string systemError()
{
    return std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
}

bool attach(SqliteConnection& source, const std::string& path)
{
    return SqliteStatement(source, "ATTACH ? AS target").run(std::string_view(path));
}

// Undoes a transaction, if there is one, and clears the error.
void detach(SqliteConnection& source)
{
    for (const char* statement : {"ROLLBACK", "DETACH target", "DROP TABLE IF EXISTS temp.chosen"}) {
        source.clearError();
        source.execute(statement);
    }
    source.clearError();
}

// Empty for a database that holds timelines or, so far, nothing.
std::string faultOfTarget(SqliteConnection& source)
{
    return timeline_schema::isEmpty(source, "target") ? "" : timeline_schema::faultOf(source, "target");
}

Taken move(SqliteConnection& source)
{
    // The lock comes first: two processes that both read and then want to write would wait for each other.
    source.execute("BEGIN IMMEDIATE");
    if (const std::string fault = faultOfTarget(source); !fault.empty())
        return {.error = fault};
    if (timeline_schema::isEmpty(source, "target")) {
        timeline_schema::makeTables(source, "target");
        timeline_schema::finish(source, "target");
    }
    source.execute(kChoose);
    source.execute(kReplace);
    const std::size_t replaced = source.count("SELECT changes()");
    source.execute(kAdd);
    const std::size_t added = source.count("SELECT changes()");
    if (added > 0)
        source.execute(kAnalyze);
    const std::size_t all = source.count("SELECT count(*) FROM main.captures");
    source.execute("COMMIT");
    return {.added = added, .replaced = replaced, .known = all - added, .error = source.error()};
}

Taken moveInto(SqliteConnection& source, const std::string& path)
{
    Taken taken = attach(source, path) ? move(source) : Taken{.error = source.error()};
    detach(source);
    return taken;
}

// Renames without replacing.
bool giveName(const std::string& file, const std::string& name)
{
    // Network file systems know links only, those of memory cards only renaming.
    return ::link(file.c_str(), name.c_str()) == 0
        || (errno != EEXIST
            && ::renameat2(AT_FDCWD, file.c_str(), AT_FDCWD, name.c_str(), RENAME_NOREPLACE) == 0);
}

} // namespace

TimelineDatabase::TimelineDatabase(const std::string& path)
{
    const LinkEnd end = followLinks(path, FollowedLinks::trusted);
    _path = std::filesystem::absolute(end.path); // neither a URI nor a name special to SQLite
    _fault = end.error;
}

std::string TimelineDatabase::fault() const
{
    if (!_fault.empty())
        return _fault;
    if (!exists()) {
        const std::string directory = std::filesystem::path(_path).parent_path();
        return ::access(directory.c_str(), W_OK | X_OK) == 0 ? "" : systemError();
    }
    if (std::string fault = faultOfFile(); !fault.empty())
        return fault;
    SqliteConnection connection;
    return attach(connection, _path) ? faultOfTarget(connection) : connection.error();
}

std::string TimelineDatabase::faultOfFile() const
{
    struct stat status { };
    if (::stat(_path.c_str(), &status) != 0 || ::access(_path.c_str(), W_OK) != 0)
        return systemError();
    if (!S_ISREG(status.st_mode))
        return "is not a regular file";
    return status.st_uid == ::geteuid() ? "" : "belongs to another user";
}

Taken TimelineDatabase::take(SqliteConnection& source) const
{
    while (!exists()) {
        if (const std::optional<Taken> taken = create(source))
            return *taken;
    }
    const std::string fault = faultOfFile(); // another process may have made it
    return fault.empty() ? moveInto(source, _path) : Taken{.error = fault};
}

std::optional<Taken> TimelineDatabase::create(SqliteConnection& source) const
{
    std::string file = _path + ".XXXXXX";
    const int descriptor = ::mkstemp(file.data()); // of mode 0600
    if (descriptor < 0)
        return Taken{.error = systemError()};
    ::close(descriptor);
    Taken taken = moveInto(source, file);
    const bool isWhole = taken.error.empty();
    const bool isTaken = isWhole && !giveName(file, _path);
    if (isTaken && errno != EEXIST)
        taken.error = systemError();
    ::unlink(file.c_str());
    if (isTaken && taken.error.empty())
        return std::nullopt;
    return taken;
}

bool TimelineDatabase::exists() const
{
    return ::access(_path.c_str(), F_OK) == 0;
}

} // namespace orvex
