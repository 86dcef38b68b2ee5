#pragma once

#include "modem/ModemState.h"

#include <cstdint>
#include <string>

namespace orvex::korat {

// Knows a modem's state through a service of the operating system. Another service than ModemManager needs
// another reader, nothing else.
//
// A reader that is not asking listens to what the service tells by itself, and has no command sent to the
// modem.
class ModemReader {
public:
    virtual ~ModemReader() = default;

    // Connects to the service. Returns why it cannot, in one line; empty when it can. A service that is not
    // there yet may come later.
    virtual std::string start() = 0;
    // From now on, or no longer, has the modem asked for what changes: cells, location, signal.
    virtual void setAsking(bool isAsking) = 0;
    virtual const ModemState& state() const = 0;
    // Grows with every change of the state.
    virtual std::uint64_t version() const = 0;
};

} // namespace orvex::korat
