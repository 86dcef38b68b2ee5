#include "GSMDedicatedChannelPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GSMDedicatedChannelPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 17);
    packet.u16(13, arfcn);
    return packet.take();
}

} // namespace orvex::korat
