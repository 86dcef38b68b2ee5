#pragma once

#include "Date.h"

namespace orvex {

// The wall clock and the local time zone.
class Clock {
public:
    struct Zone {
        int secondsEastOfUTC = 0; // daylight saving included
        bool isDaylightSaving = false;
    };

    virtual ~Clock() = default;

    virtual Date now() const = 0;
    // The local zone as it applies at the given moment.
    virtual Zone zoneAt(Date moment) const = 0;
};

} // namespace orvex
