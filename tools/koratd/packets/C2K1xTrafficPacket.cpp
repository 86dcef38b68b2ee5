#include "C2K1xTrafficPacket.h"

#include "C2KSubpacketWriter.h"

namespace orvex::korat {

LogMessage C2K1xTrafficPacket::message(Microseconds time) const
{
    C2KSubpacketWriter packet(kCode, time, {28});
    packet.start(11);
    packet.u8(24, hasErrors ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
