#include "C2K1xSystemPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

namespace {
constexpr int kVersion = 2;
constexpr int k1xSystem = 2;
} // namespace

LogMessage C2K1xSystemPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 186);
    packet.u8(13, kVersion);
    packet.s32(42, static_cast<std::int32_t>(roaming));
    packet.s32(46, k1xSystem);
    packet.u16(50, systemID);
    packet.u16(52, networkID);
    packet.u8(131, packetZoneID);
    packet.u8(133, protocolRevision);
    packet.u16(184, baseID);
    return packet.take();
}

} // namespace orvex::korat
