#include "UTRANRRCStatePacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage UTRANRRCStatePacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 15);
    packet.u8(13, state ? 1 : 0);
    packet.u8(14, state ? static_cast<int>(*state) : 0);
    return packet.take();
}

} // namespace orvex::korat
