#pragma once

#include "RunLoop.h"

#include <chrono>
#include <optional>

namespace orvex {

// The moment at which a message was captured. None when the capture does not know: a DLF may count in a unit
// of the modem's own, which puts its messages outside of the years 2000 to 2099.
inline std::optional<Date> captureDate(std::chrono::microseconds time)
{
    constexpr std::chrono::seconds kYear2000{946'684'800};
    constexpr std::chrono::seconds kYear2100{4'102'444'800};
    if (time < kYear2000 || time >= kYear2100)
        return std::nullopt;
    return Date{std::chrono::duration<double>(time).count()};
}

// The clock of a session that is decoded from a capture: shows when the last message was captured, in UTC. As
// long as no message had a time, it shows the time of another clock.
class CaptureClock final : public Clock {
public:
    explicit CaptureClock(const Clock& other)
        : _other(other)
    {
    }

    void setTime(std::chrono::microseconds time)
    {
        if (const auto date = captureDate(time))
            _now = date;
    }

    Date now() const override { return _now ? *_now : _other.now(); }
    Zone zoneAt(Date /*moment*/) const override { return {}; }

private:
    const Clock& _other;
    std::optional<Date> _now;
};

} // namespace orvex
