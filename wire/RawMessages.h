#pragma once

#include "Value.h"

#include <optional>

namespace orvex {

// Walks the raw messages of one refresh interval in a snapshot: baseband packets back to back, their lengths
// in their headers:
//
//   0  u8   0x81 if a two-byte prefix precedes the packet; otherwise the packet begins here
//   0  u8   log type
//   1  u16  length of the packet without the log type
class RawMessages {
public:
    explicit RawMessages(ByteView bytes)
        : _rest(bytes)
    {
    }

    // The next message with its prefix. None at the end or at an invalid length.
    std::optional<ByteView> next();
    // Bytes not yet walked. After the last message: those that form none.
    std::size_t rest() const { return _rest.size(); }

private:
    ByteView _rest;
};

} // namespace orvex
