#include "ServingPLMNPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage ServingPLMNPacket::message(Microseconds time) const
{
    const int first = plmn.mncDigits - 1; // place of the network code's first digit
    const int thirdDigit = plmn.mncDigits == 3 ? digit(plmn.mnc, 0) : 15;

    PacketWriter packet(kCode, time, 32);
    packet.u8(13, operatingMode);
    packet.u8(14, static_cast<int>(service));
    packet.u8(15, digit(plmn.mcc, 2) | digit(plmn.mcc, 1) << 4);
    packet.u8(16, digit(plmn.mcc, 0) | thirdDigit << 4);
    packet.u8(17, digit(plmn.mnc, first) | digit(plmn.mnc, first - 1) << 4);
    packet.u8(18, locationAreaCode >> 8);
    packet.u8(19, locationAreaCode & 0xFF);
    packet.u8(20, routingAreaCode);
    return packet.take();
}

} // namespace orvex::korat
