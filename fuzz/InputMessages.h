#pragma once

#include "MessagePort.h"

#include <optional>
#include <span>

namespace orvex::fuzz {

// The messages of an input, back to back, each behind its length as a little-endian u16. A length that
// reaches beyond the input takes what is left of it, so that every input is one.
class InputMessages {
public:
    explicit InputMessages(ByteView input)
        : _rest(input)
    {
    }

    // A copy without a byte to spare, so that reading beyond it is seen. None at the end.
    std::optional<Bytes> next();
    ByteView rest() const { return _rest; }

    static Bytes inputOf(std::span<const Bytes> messages);

private:
    ByteView _rest;
};

} // namespace orvex::fuzz
