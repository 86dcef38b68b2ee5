#include "RegistrationPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage RegistrationPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 16);
    packet.u8(13, static_cast<int>(state));
    packet.u8(14, static_cast<int>(selection));
    return packet.take();
}

} // namespace orvex::korat
