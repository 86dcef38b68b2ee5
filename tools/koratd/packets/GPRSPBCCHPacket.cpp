#include "GPRSPBCCHPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GPRSPBCCHPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 34);
    packet.u8(13, isPresent ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
