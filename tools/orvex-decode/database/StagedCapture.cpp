#include "database/StagedCapture.h"

#include "database/CaptureHash.h"
#include "database/TimelineSchema.h"

#include "Quantity.h"

#include <optional>
#include <string_view>

namespace orvex {

namespace {

// The tables, but samples are kept as they come, and the capture's identity is known only at the end.
SqliteConnection makeStage()
{
    SqliteConnection connection;
    timeline_schema::makeTables(connection, "main");
    connection.execute(R"(
        DROP TABLE samples;
        CREATE TABLE staged (n INTEGER, time REAL, path INTEGER, text TEXT, number REAL, unit TEXT);
        CREATE VIEW samples AS
            SELECT path, (SELECT id FROM captures) AS capture, n, time, text, number, unit FROM staged;
        BEGIN)");
    return connection;
}

} // namespace

StagedCapture::StagedCapture()
    : _connection(makeStage())
    , _addPath(_connection, "INSERT INTO paths VALUES (?, ?, ?)")
    , _addSample(_connection, "INSERT INTO staged VALUES (?, ?, ?, ?, ?, ?)")
{
}

void StagedCapture::sample(Date time)
{
    ++_samples;
    _time = time;
}

void StagedCapture::addRow(std::size_t /*number*/, const TimelineRow& row)
{
    _paths.push_back(identityOf(row));
    _addPath.run(_paths.back(), std::string_view(row.path), std::string_view(row.key));
}

void StagedCapture::set(std::size_t number, const std::string& text)
{
    const std::optional<Quantity> quantity = quantityOf(text);
    const auto value = quantity ? std::optional(quantity->number) : std::nullopt;
    const auto unit = quantity ? std::optional(quantity->unit) : std::nullopt;
    _addSample.run(_samples, _time.secondsSince1970, _paths[number], std::string_view(text), value, unit);
}

void StagedCapture::clear(std::size_t number)
{
    constexpr std::optional<std::string_view> kNothing;
    _addSample.run(_samples, _time.secondsSince1970, _paths[number], kNothing, kNothing, kNothing);
}

SqliteConnection& StagedCapture::finish(const CaptureRecord& record)
{
    SqliteStatement(_connection, "INSERT INTO captures VALUES (?, ?, ?, ?, ?, ?, ?, ?, ?)")
        .run(record.id, std::string_view(record.name), std::string_view(record.technology),
            record.first.secondsSince1970, record.last.secondsSince1970,
            static_cast<std::int64_t>(record.messages), record.every, std::string_view(record.fields),
            std::string_view(ORVEX_VERSION));
    _connection.execute("COMMIT");
    return _connection;
}

} // namespace orvex
