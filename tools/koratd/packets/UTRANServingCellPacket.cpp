#include "UTRANServingCellPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage UTRANServingCellPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 26);
    packet.u8(14, accessRestrictions);
    packet.u8(15, uraID);
    packet.u16(17, uplinkUARFCN);
    packet.u16(19, downlinkUARFCN);
    packet.s32(21, cellIdentity);
    packet.bits(25, 0, 1, emergencyCallsOnly ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
