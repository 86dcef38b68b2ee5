#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

namespace orvex {

struct CloseSqlite {
    void operator()(sqlite3* connection) const;
    void operator()(sqlite3_stmt* statement) const;
};

// A connection to an SQLite database, the schema "main", and to what is attached beside it. After an error it
// does nothing more, so callers may ask for the error at the end.
class SqliteConnection {
public:
    // A database of the connection's own, which spills to a temporary file (in $SQLITE_TMPDIR) and is deleted
    // with the connection.
    SqliteConnection();
    // An existing database, which is only read. What is attached can be written.
    explicit SqliteConnection(const std::string& path);

    // Runs statements that need no values and give none.
    bool execute(const std::string& statements);
    // The number that a query gives, not negative; 0 after an error.
    std::size_t count(const std::string& query);

    bool isGood() const { return _error.empty(); }
    // Without the path; empty for none.
    const std::string& error() const { return _error; }
    void clearError() { _error.clear(); }

private:
    friend class SqliteStatement;

    void open(const std::string& name);
    void fail();

    std::unique_ptr<sqlite3, CloseSqlite> _connection;
    std::string _error;
};

// A statement that is prepared once. Its columns and parameters count from 0.
class SqliteStatement {
public:
    // The connection outlives the statement.
    SqliteStatement(SqliteConnection& connection, std::string_view sql);

    // Runs it to its end with these values.
    template <class... Values>
    bool run(const Values&... values)
    {
        int parameter = 0;
        (bind(parameter++, values), ...);
        while (step()) { }
        return _connection.isGood();
    }

    // A text must live until the last step().
    void bind(int parameter, std::int64_t number);
    void bind(int parameter, double number);
    void bind(int parameter, std::string_view text);
    template <class Value>
    void bind(int parameter, const std::optional<Value>& value)
    {
        if (value)
            bind(parameter, *value);
        else
            bindNull(parameter);
    }

    // Goes to the next row. Returns false, and can be stepped anew, at the end and after an error.
    bool step();
    std::int64_t integer(int column) const;

private:
    void bindNull(int parameter);

    SqliteConnection& _connection;
    std::unique_ptr<sqlite3_stmt, CloseSqlite> _statement; // null after an error
};

} // namespace orvex
