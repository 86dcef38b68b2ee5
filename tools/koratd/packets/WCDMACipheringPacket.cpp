#include "WCDMACipheringPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage WCDMACipheringPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 19);
    packet.u8(13, isEnabled ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
