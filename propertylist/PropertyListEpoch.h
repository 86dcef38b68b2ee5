#pragma once

namespace orvex {

// Property lists count dates from 2001-01-01 00:00:00 UTC.
inline constexpr double kPropertyListEpoch = 978'307'200; // seconds since 1970

} // namespace orvex
