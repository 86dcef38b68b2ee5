#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// EV-DO status: where the access terminal is, how it hears and speaks, its session.
class EVDOStatus {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
