#pragma once

#include "LogCode.h"
#include "Value.h"

#include <chrono>
#include <cstdint>
#include <optional>

namespace orvex::korat {

// The time in a packet's header: microseconds since 1970-01-01 00:00:00 UTC.
using Microseconds = std::chrono::microseconds;

// One message of the log channel, as it goes over the wire.
struct LogMessage {
    std::optional<LogCode> code; // none: no packet, but a whole property list
    Bytes bytes;
};

} // namespace orvex::korat
