#include "WCDMARankingPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage WCDMARankingPacket::message(Microseconds time) const
{
    const std::size_t u = std::min(umtsNeighbors.size(), kLargestCount);
    const std::size_t g = std::min(gsmNeighbors.size(), kLargestCount);

    PacketWriter packet(kCode, time, 15 + std::max(10 * u, 7 * g));
    packet.u8(13, static_cast<std::int64_t>(u));
    packet.u8(14, static_cast<std::int64_t>(g));
    for (std::size_t i = 0; i < u; ++i) {
        const std::size_t record = 15 + 10 * i;
        packet.u16(record, umtsNeighbors[i].uarfcn);
        packet.u16(record + 2, umtsNeighbors[i].scramblingCode);
        packet.s8(record + 4, steps(umtsNeighbors[i].rscp, -21, 1));
        packet.s16(record + 5, steps(umtsNeighbors[i].rankingRSCP, 0, 1));
        packet.s8(record + 7, steps(umtsNeighbors[i].ecNo, 0, 0.5));
        packet.s16(record + 8, umtsNeighbors[i].rank);
    }
    for (std::size_t i = 0; i < g; ++i) {
        const std::size_t record = 15 + 7 * i;
        packet.u16(record, gsmNeighbors[i].arfcn);
        packet.u16(record + 2, gsmNeighbors[i].bsic);
        packet.s8(record + 4, steps(gsmNeighbors[i].rssi, 0, 1));
        packet.s16(record + 5, gsmNeighbors[i].rank);
    }
    return packet.take();
}

} // namespace orvex::korat
