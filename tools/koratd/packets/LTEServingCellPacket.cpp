#include "LTEServingCellPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage LTEServingCellPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 38);
    packet.u16(14, physicalCellID);
    packet.u16(16, downlinkEARFCN);
    packet.u16(18, uplinkEARFCN);
    packet.u8(20, downlinkResourceBlocks);
    packet.u8(21, uplinkResourceBlocks);
    packet.s32(22, cellIdentity);
    packet.u16(26, trackingAreaCode);
    packet.s32(28, band);
    return packet.take();
}

} // namespace orvex::korat
