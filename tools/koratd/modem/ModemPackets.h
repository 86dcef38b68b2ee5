#pragma once

#include "modem/ModemState.h"

#include "LogCode.h"
#include "Value.h"

namespace orvex::korat {

// The payload of a message that a technology shows, without its packet header.
struct Content {
    std::optional<LogCode> code; // none: the message has no header either
    Bytes payload;
};

// What a technology shows of the modem's state. Measurements of LTE are written only if asked for: the packet
// that carries them claims connected mode, which the modem does not tell.
std::vector<Content> contentsFor(
    const std::string& technology, const ModemState& state, bool withMeasurements);

// The content as a message of the log channel; microseconds since 1970.
Bytes messageOf(const Content& content, std::uint64_t time);

} // namespace orvex::korat
