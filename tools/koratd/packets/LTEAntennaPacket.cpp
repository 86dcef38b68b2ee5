#include "LTEAntennaPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage LTEAntennaPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 22);
    packet.u8(20, transmitAntennas);
    return packet.take();
}

} // namespace orvex::korat
