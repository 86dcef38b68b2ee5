#pragma once

#include "Value.h"

#include <chrono>
#include <cstdint>
#include <optional>

namespace orvex::korat {

// A log code as clients subscribe to it: the 16-bit code of a baseband packet, or an extra code above
// kExtraCodes.
using LogCode = std::uint32_t;
inline constexpr LogCode kExtraCodes = 0xFF0000;

// The time in a packet's header: microseconds since 1970-01-01 00:00:00 UTC.
using Microseconds = std::chrono::microseconds;

// One message of the log channel, as it goes over the wire.
struct LogMessage {
    std::optional<LogCode> code; // none: no packet, but a whole property list
    Bytes bytes;
};

} // namespace orvex::korat
