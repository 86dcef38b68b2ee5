#include "C2KForwardLinkPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage C2KForwardLinkPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 17 + 4 * kFormatCount);
    packet.u32(13, sequenceNumber);
    for (std::size_t i = 0; i < kFormatCount; ++i)
        packet.u32(17 + 4 * i, packets[i]);
    return packet.take();
}

} // namespace orvex::korat
