#include "GPRSCellOptionsPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GPRSCellOptionsPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 24);
    packet.u8(15, t3192);
    packet.u8(16, longestNonDRX);
    packet.u8(17, hasLongBursts ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
