#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// EV-DO forward link counters: the data rate that the handset receives.
class ForwardLinkRate {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
