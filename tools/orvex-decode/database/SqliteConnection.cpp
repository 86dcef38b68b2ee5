#include "database/SqliteConnection.h"

#include <cerrno>
#include <cstring>
#include <filesystem>

#include <sqlite3.h>

namespace orvex {

namespace {

constexpr int kPatience = 600'000; // ms; another process may be storing a large capture

// The path as a URI that asks for no more than reading.
std::string readOnlyUri(const std::string& path)
{
    constexpr std::string_view kDigits = "0123456789ABCDEF";
    std::string uri = "file:";
    for (const char character : std::filesystem::absolute(path).string()) {
        const auto byte = static_cast<unsigned char>(character);
        if (std::strchr("%?#", character) == nullptr)
            uri += character;
        else
            (uri += '%').append({kDigits[byte / 16], kDigits[byte % 16]});
    }
    return uri + "?mode=ro";
}

} // namespace

void CloseSqlite::operator()(sqlite3* connection) const
{
    sqlite3_close(connection);
}

void CloseSqlite::operator()(sqlite3_stmt* statement) const
{
    sqlite3_finalize(statement);
}

SqliteConnection::SqliteConnection()
{
    open("");
    execute("PRAGMA temp_store = FILE; PRAGMA journal_mode = OFF");
}

SqliteConnection::SqliteConnection(const std::string& path)
{
    open(readOnlyUri(path));
}

void SqliteConnection::open(const std::string& name)
{
    sqlite3* connection = nullptr;
    // The flags hold for what is attached, too.
    const int status = sqlite3_open_v2(name.c_str(), &connection,
        SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_URI | SQLITE_OPEN_NOMUTEX, nullptr);
    _connection.reset(connection);
    if (status != SQLITE_OK)
        fail();
    else
        sqlite3_busy_timeout(connection, kPatience);
    execute("PRAGMA trusted_schema = OFF"); // a database may come from elsewhere
}

bool SqliteConnection::execute(const std::string& statements)
{
    if (isGood()
        && sqlite3_exec(_connection.get(), statements.c_str(), nullptr, nullptr, nullptr) != SQLITE_OK)
        fail();
    return isGood();
}

std::size_t SqliteConnection::count(const std::string& query)
{
    SqliteStatement statement(*this, query);
    return statement.step() ? static_cast<std::size_t>(statement.integer(0)) : 0;
}

void SqliteConnection::fail()
{
    if (!isGood())
        return;
    _error = sqlite3_errmsg(_connection.get());
    const int code = sqlite3_errcode(_connection.get());
    const int reason = sqlite3_system_errno(_connection.get());
    if ((code == SQLITE_CANTOPEN || code == SQLITE_IOERR) && reason != 0)
        (_error += ": ") += std::strerror(reason); // NOLINT(concurrency-mt-unsafe)
}

SqliteStatement::SqliteStatement(SqliteConnection& connection, std::string_view sql)
    : _connection(connection)
{
    sqlite3_stmt* statement = nullptr;
    if (!connection.isGood())
        return;
    if (sqlite3_prepare_v3(connection._connection.get(), sql.data(), static_cast<int>(sql.size()),
            SQLITE_PREPARE_PERSISTENT, &statement, nullptr)
        != SQLITE_OK)
        connection.fail();
    _statement.reset(statement);
}

void SqliteStatement::bind(int parameter, std::int64_t number)
{
    sqlite3_bind_int64(_statement.get(), parameter + 1, number);
}

void SqliteStatement::bind(int parameter, double number)
{
    sqlite3_bind_double(_statement.get(), parameter + 1, number);
}

void SqliteStatement::bind(int parameter, std::string_view text)
{
    // SQLite takes a null pointer for NULL.
    const char* start = text.data() != nullptr ? text.data() : "";
    sqlite3_bind_text(_statement.get(), parameter + 1, start, static_cast<int>(text.size()), SQLITE_STATIC);
}

void SqliteStatement::bindNull(int parameter)
{
    sqlite3_bind_null(_statement.get(), parameter + 1);
}

bool SqliteStatement::step()
{
    if (!_statement || !_connection.isGood())
        return false;
    const int status = sqlite3_step(_statement.get());
    if (status == SQLITE_ROW)
        return true;
    if (status != SQLITE_DONE)
        _connection.fail();
    sqlite3_reset(_statement.get());
    return false;
}

std::int64_t SqliteStatement::integer(int column) const
{
    return sqlite3_column_int64(_statement.get(), column);
}

} // namespace orvex
