#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// 1x traffic frames: counts the erroneous ones into the frame-error rate.
class OneXTrafficFrames {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
