#include "WCDMARRCStatePacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage WCDMARRCStatePacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 14);
    packet.u8(13, static_cast<int>(state));
    return packet.take();
}

} // namespace orvex::korat
