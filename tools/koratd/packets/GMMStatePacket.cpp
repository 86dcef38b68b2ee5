#include "GMMStatePacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GMMStatePacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 16);
    packet.u8(13, static_cast<int>(state));
    packet.u8(14, static_cast<int>(substate));
    packet.u8(15, static_cast<int>(update));
    return packet.take();
}

} // namespace orvex::korat
