#include "GPRSSystemInformationPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage GPRSSystemInformationPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 35);
    packet.u8(13, psiStatus);
    packet.u8(14, lowRepetitionCount);
    packet.u8(15, highRepetitionCount);
    packet.u8(16, extendedMeasurementOrder);
    packet.u8(33, supportsSIStatus ? 1 : 0);
    return packet.take();
}

} // namespace orvex::korat
