#include "SystemClock.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <ctime>

namespace orvex {

Date SystemClock::now() const
{
    const auto sinceEpoch = std::chrono::system_clock::now().time_since_epoch(); // counts from 1970 UTC
    return {std::chrono::duration<double>(sinceEpoch).count()};
}

Clock::Zone SystemClock::zoneAt(Date moment) const
{
    // Within what the calendar of the C library can count.
    constexpr double kFarthest = 1e15;
    const double seconds = std::isnan(moment.secondsSince1970) ? 0 : std::floor(moment.secondsSince1970);
    const auto time = static_cast<std::time_t>(std::clamp(seconds, -kFarthest, kFarthest));
    std::tm local{};
    tzset(); // localtime_r alone need not look at $TZ
    if (!localtime_r(&time, &local))
        return {};
    return {static_cast<int>(local.tm_gmtoff), local.tm_isdst > 0};
}

} // namespace orvex
