#pragma once

#include "TimelineSink.h"
#include "Value.h"

#include <chrono>
#include <cstdint>

namespace orvex {

// Identifies a capture by its messages and their times, whatever the file's name, format or compression.
class CaptureHash {
public:
    void add(ByteView message, std::chrono::microseconds time);
    std::int64_t value() const;

private:
    std::uint64_t _hash = 0;
};

// Identifies a row by its path and key.
std::int64_t identityOf(const TimelineRow& row);

} // namespace orvex
