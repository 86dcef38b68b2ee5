#include "GSMServingCellPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GSMServingCellPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 26);
    packet.u16(13, arfcn);
    packet.u16(15, bsic);
    packet.u16(17, cellID);
    return packet.take();
}

} // namespace orvex::korat
