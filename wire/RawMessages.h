#pragma once

#include "Value.h"

#include <optional>

namespace orvex {

// The messages that a snapshot keeps of one refresh interval: baseband packets back to back, each of the
// length that its header tells:
//
//   0  u8   0x81 when a prefix of 2 bytes stands before the packet; else the packet begins here
//   0  u8   log type
//   1  u16  length of the packet without the log type
class RawMessages {
public:
    explicit RawMessages(ByteView bytes)
        : _rest(bytes)
    {
    }

    // The next one, its prefix included. None at the end, or where a length leads nowhere.
    std::optional<ByteView> next();
    // Bytes that are not yet walked. After the last message: those that make none.
    std::size_t rest() const { return _rest.size(); }

private:
    ByteView _rest;
};

} // namespace orvex
