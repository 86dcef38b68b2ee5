#pragma once

#include "Clock.h"

namespace orvex {

// The system's clock and the zone that $TZ or the system names.
class SystemClock final : public Clock {
public:
    Date now() const override;
    Zone zoneAt(Date moment) const override;
};

} // namespace orvex
