#include "GSMNeighborIdentityPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage GSMNeighborIdentityPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(neighbors.size(), kLargestCount);

    PacketWriter packet(kCode, time, 15 + 4 * count);
    packet.u8(14, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        packet.u16(15 + 4 * i, neighbors[i].arfcn);
        packet.u8(17 + 4 * i, neighbors[i].bsic);
    }
    return packet.take();
}

} // namespace orvex::korat
