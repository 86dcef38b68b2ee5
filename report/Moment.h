#pragma once

#include <cstddef>
#include <cstdint>

namespace orvex {

// When the display was looked at.
struct Moment {
    std::int64_t position = 0; // on the time axis of the report, in ms; see ReportClock
    std::int64_t observed = 0; // ms since the first message, without gaps
    std::size_t sample = 0;    // number of looks before this one
};

} // namespace orvex
