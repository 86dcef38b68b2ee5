#include "GSMDTXPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GSMDTXPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 20);
    packet.u8(19, isUsed ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
