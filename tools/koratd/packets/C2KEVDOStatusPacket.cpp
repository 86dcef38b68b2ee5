#include "C2KEVDOStatusPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage C2KEVDOStatusPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 50);
    packet.bits(13, 0, 11, channel);
    packet.bits(13, 11, 5, bandClass);
    packet.s8(15, steps(receiveAGC0, 0, 1));
    packet.s8(16, steps(receiveAGC1, 0, 1));
    packet.s8(17, steps(transmitAGC, 0, 1));
    packet.u16(18, servingPN.value_or(65535));
    packet.u8(36, static_cast<int>(state));
    packet.u8(37, static_cast<int>(session));
    packet.bits(38, 0, 24, uati24);
    packet.u8(41, colorCode);
    return packet.take();
}

} // namespace orvex::korat
