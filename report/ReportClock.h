#pragma once

#include "Date.h"
#include "Moment.h"
#include "TreeJson.h"

#include <chrono>
#include <cstdint>
#include <vector>

namespace orvex {

// The time axis of a report: milliseconds since 1970 that never decrease. Where the clock of the capture goes
// back by more than a second, a shift joins what follows to what came before.
//
// A gap is a pause of more than 10 seconds between messages.
class ReportClock {
public:
    static constexpr std::int64_t kShortestGap = 10'000; // ms
    static constexpr std::size_t kLimit = 1'000;         // of the gaps and of the shifts listed

    void takeMessage(std::chrono::microseconds time);
    // The display is looked at.
    const Moment& takeSample(Date time);

    const Moment& lastSample() const { return _last; }
    std::size_t samples() const { return _samples; }
    // Of all messages, without gaps.
    std::int64_t observed() const { return _newest - _first - _inGaps; }

    // The members "first", "last", "samples", "shifts", "gaps" and "gapsOmitted" of the report.
    void writeJson(JsonWriter& json) const;

private:
    struct Shift {
        std::int64_t from; // position
        std::int64_t shift;
    };
    struct Gap {
        std::int64_t from; // positions
        std::int64_t to;
    };

    bool _hasMessage = false;
    std::chrono::microseconds _newestTime{}; // of the messages since the last shift, as captured
    std::int64_t _first = 0;                 // positions of messages
    std::int64_t _newest = 0;
    std::int64_t _shift = 0;
    std::int64_t _inGaps = 0;
    Moment _last;
    std::size_t _samples = 0;
    std::vector<Shift> _shifts;
    std::vector<Gap> _gaps;
    std::size_t _gapsOmitted = 0;
};

} // namespace orvex
