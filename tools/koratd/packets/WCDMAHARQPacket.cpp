#include "WCDMAHARQPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

namespace {
void writeProcess(PacketWriter& packet, std::size_t offset, const WCDMAHARQPacket::Process& process)
{
    packet.u8(offset, process.identity);
    packet.u32(offset + 1, process.bits);
    packet.u16(offset + 5, process.newBlocks);
    packet.u16(offset + 7, process.blockErrors);
}
} // namespace

LogMessage WCDMAHARQPacket::message(Microseconds time) const
{
    const std::size_t p = std::min(primary.size(), kLargestCount);
    const std::size_t s = std::min(secondary.size(), kLargestCount);
    const std::size_t firstSecondary = 18 + 162 * p;

    PacketWriter packet(kCode, time, s > 0 ? firstSecondary + 9 * s : 18 + 9 * p);
    packet.u8(13, version);
    packet.bits(14, 0, 10, subframes);
    packet.bits(14, 10, 2, static_cast<int>(carriers));
    packet.u8(16, static_cast<std::int64_t>(p));
    packet.u8(17, static_cast<std::int64_t>(s));
    for (std::size_t i = 0; i < p; ++i)
        writeProcess(packet, 18 + 9 * i, primary[i]);
    for (std::size_t j = 0; j < s; ++j)
        writeProcess(packet, firstSecondary + 9 * j, secondary[j]);
    return packet.take();
}

} // namespace orvex::korat
