#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// The pilots that the EV-DO access terminal is connected to, and their strengths.
class EVDOActiveSet {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
