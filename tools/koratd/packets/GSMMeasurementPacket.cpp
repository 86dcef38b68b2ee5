#include "GSMMeasurementPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage GSMMeasurementPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(neighbors.size(), kLargestCount);

    PacketWriter packet(kCode, time, 29 + 14 * count);
    packet.u8(15, steps(-level, 0, 1));
    packet.u32(16, c1OrQualityFull);
    packet.u32(20, c2OrQualitySub);
    packet.u8(26, isHysteresisApplied ? 1 : 0);
    packet.u8(28, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 29 + 14 * i;
        packet.u16(record, neighbors[i].arfcn);
        packet.u8(record + 2, steps(-neighbors[i].level, 0, 1));
        packet.s32(record + 3, neighbors[i].c1);
    }
    return packet.take();
}

} // namespace orvex::korat
