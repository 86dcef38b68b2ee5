#pragma once

#include <cmath>

namespace orvex::korat {

// A road that the handset is driven along, forth and back.
struct Road {
    double length = 0; // m
    double speed = 0;  // m/s

    double positionAfter(double seconds) const
    {
        const double driven = std::fmod(seconds * speed, 2 * length);
        return driven <= length ? driven : 2 * length - driven;
    }
};

} // namespace orvex::korat
