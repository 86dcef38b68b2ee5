#pragma once

#include "database/SqliteConnection.h"

#include "TimelineSink.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace orvex {

// What a database says of a capture beside its samples.
struct CaptureRecord {
    std::int64_t id = 0; // of CaptureHash
    std::string name;
    std::string technology;
    Date first; // the earliest message and the latest
    Date last;
    std::size_t messages = 0;
    double every = 0; // seconds
    std::string fields;
};

// Gathers a capture's timeline in a database of its own, off memory, until all of it is known.
class StagedCapture final : public TimelineSink {
public:
    StagedCapture();

    void sample(Date time) override;
    void addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text) override;
    void clear(std::size_t number) override;

    // Ends the capture. Its error tells whether all of it is there.
    SqliteConnection& finish(const CaptureRecord& record);

private:
    SqliteConnection _connection;
    Date _time;
    std::int64_t _samples = 0;
    std::vector<std::int64_t> _paths; // by row
    SqliteStatement _addPath;
    SqliteStatement _addSample;
};

} // namespace orvex
