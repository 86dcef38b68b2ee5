#include "GSMRRStatePacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GSMRRStatePacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 17);
    packet.u8(13, static_cast<int>(state));
    packet.u8(14, substate);
    packet.u8(15, status);
    packet.u8(16, isData ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
