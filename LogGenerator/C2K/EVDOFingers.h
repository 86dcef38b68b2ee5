#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// The fingers of the EV-DO receiver: which pilot each follows, and its carrier to interference.
class EVDOFingers {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
