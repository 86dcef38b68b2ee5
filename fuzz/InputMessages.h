#pragma once

#include "MessagePort.h"

#include <optional>
#include <span>

namespace orvex::fuzz {

// Splits an input into messages, each preceded by its length as a little-endian u16. A length beyond the end
// of the input takes the rest, so every input is valid.
class InputMessages {
public:
    explicit InputMessages(ByteView input)
        : _rest(input)
    {
    }

    // The next message in an allocation of its exact size, so the sanitizer sees reads beyond it. None at the
    // end.
    std::optional<Bytes> next();
    ByteView rest() const { return _rest; }

    static Bytes inputOf(std::span<const Bytes> messages);

private:
    ByteView _rest;
};

} // namespace orvex::fuzz
