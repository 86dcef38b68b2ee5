#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// 1x system identity: whose network this is, and whether the handset roams in it.
class OneXSystemIdentity {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
