#include "UTRANGSMNeighborPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage UTRANGSMNeighborPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(neighbors.size(), kLargestCount);

    PacketWriter packet(kCode, time, 17 + 8 * count);
    packet.u8(16, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 17 + 8 * i;
        const Neighbor& neighbor = neighbors[i];
        packet.bits(record, 0, 14, neighbor.cellID);
        packet.bits(record, 14, 1, neighbor.isPCS1900 ? 1 : 0);
        packet.bits(record, 15, 1, neighbor.isBSICValid ? 1 : 0);
        packet.u8(record + 2, neighbor.networkColorCode);
        packet.u8(record + 3, neighbor.baseStationColorCode);
        packet.u16(record + 4, neighbor.arfcn);
        packet.s16(record + 6, steps(neighbor.rssi, 0, 1));
    }
    return packet.take();
}

} // namespace orvex::korat
