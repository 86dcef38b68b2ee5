#include "GSMMobileAllocationPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage GSMMobileAllocationPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(arfcns.size(), kLargestCount);

    PacketWriter packet(kCode, time, 15 + 2 * count);
    packet.u8(13, hoppingSequenceNumber);
    packet.u8(14, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i)
        packet.u16(15 + 2 * i, arfcns[i]);
    return packet.take();
}

} // namespace orvex::korat
