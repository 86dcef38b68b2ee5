#pragma once

#include "RecordedStream.h"

#include <limits>
#include <string>

namespace orvex {
class SystemLog;
}

namespace orvex::bench {

inline constexpr std::size_t kOnceAtTheEnd = std::numeric_limits<std::size_t>::max();

// Decodes the messages in every iteration, with this system log. The display, which hands over the raw
// packets, is asked for after so many messages, or once at the end.
void decodeInto(SystemLog& log, benchmark::State& state, const Technology& technology,
    const std::vector<Bytes>& messages, std::size_t messagesPerRefresh);

// Enters a benchmark as "KIND/TECHNOLOGY".
void registerDecode(const std::string& kind, const Technology& technology,
    void (*decode)(benchmark::State& state, const Technology& technology));

} // namespace orvex::bench
