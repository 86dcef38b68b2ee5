#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

namespace orvex {

// 1x status: device state, receivers and transmitter, active set. Outside traffic it also ends the average of
// the frame-error rate.
class OneXStatus {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
