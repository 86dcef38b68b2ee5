#pragma once

#include "RunLoop.h"

namespace orvex::test {

// A clock that the test sets.
class FixedClock final : public Clock {
public:
    Date now() const override { return moment; }
    Zone zoneAt(Date) const override { return zone; }

    Date moment{1'700'000'000.75}; // 2023-11-14 22:13:20 UTC
    Zone zone;
};

} // namespace orvex::test
