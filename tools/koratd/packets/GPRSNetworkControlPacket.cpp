#include "GPRSNetworkControlPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GPRSNetworkControlPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 18);
    packet.u8(13, supportsFlowContexts ? 1 : 0);
    packet.u8(14, static_cast<int>(access));
    packet.u8(15, controlOrder.value_or(255));
    return packet.take();
}

} // namespace orvex::korat
