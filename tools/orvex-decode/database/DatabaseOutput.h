#pragma once

#include "DecodeOptions.h"
#include "TimelineOutput.h"

#include "database/CaptureHash.h"
#include "database/StagedCapture.h"
#include "database/TimelineDatabase.h"

#include <chrono>
#include <optional>
#include <string>

namespace orvex {

// Timelines of captures in a database, each added when its capture has been decoded.
class DatabaseOutput final : public TimelineOutput {
public:
    // Sets the error if nothing can be added. The options outlive the output.
    DatabaseOutput(const DecodeOptions& options, std::string& error);

    void begin(const DecodedCapture& capture) override;
    void message(ByteView message, std::chrono::microseconds time) override;
    std::string end(const DecodedCapture& capture) override;

    void sample(Date time) override { _staged->sample(time); }
    void addRow(std::size_t number, const TimelineRow& row) override { _staged->addRow(number, row); }
    void set(std::size_t number, const std::string& text) override { _staged->set(number, text); }
    void clear(std::size_t number) override { _staged->clear(number); }

private:
    const DecodeOptions& _options;
    TimelineDatabase _database;
    std::optional<StagedCapture> _staged;
    CaptureHash _hash;
    std::optional<std::chrono::microseconds> _first; // the earliest message and the latest
    std::optional<std::chrono::microseconds> _last;
};

} // namespace orvex
