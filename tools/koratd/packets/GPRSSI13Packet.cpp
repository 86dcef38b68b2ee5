#include "GPRSSI13Packet.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GPRSSI13Packet::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 15);
    packet.u8(14, static_cast<int>(position));
    return packet.take();
}

} // namespace orvex::korat
