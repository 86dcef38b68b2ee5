#include "UTRANNeighborPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage UTRANNeighborPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(neighbors.size(), kLargestCount);

    PacketWriter packet(kCode, time, 168 + 16 * count);
    packet.bits(16, 1, 7, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 168 + 16 * i;
        const Neighbor& neighbor = neighbors[i];
        packet.bits(record, 0, 14, neighbor.uarfcn);
        packet.bits(record, 14, 7, neighbor.cellID);
        packet.bits(record, 21, 8, steps(neighbor.filteredRSCP, 0, 1.0 / 256));
        packet.bits(record, 29, 2, static_cast<int>(neighbor.set));
        packet.bits(record, 31, 1, neighbor.inJointDetectionSet ? 1 : 0);
    }
    return packet.take();
}

} // namespace orvex::korat
