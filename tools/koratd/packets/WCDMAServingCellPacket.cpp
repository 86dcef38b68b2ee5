#include "WCDMAServingCellPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage WCDMAServingCellPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 29);
    packet.u32(13, uplinkUARFCN);
    packet.u32(17, downlinkUARFCN);
    packet.u32(21, cellIdentity);
    packet.u16(25, uraID);
    return packet.take();
}

} // namespace orvex::korat
