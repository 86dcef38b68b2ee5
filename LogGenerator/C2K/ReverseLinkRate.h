#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// EV-DO reverse link counters: the data rate that the handset sends.
class ReverseLinkRate {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
