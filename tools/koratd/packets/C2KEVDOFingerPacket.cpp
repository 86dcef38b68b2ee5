#include "C2KEVDOFingerPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage C2KEVDOFingerPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(fingers.size(), kLargestCount);

    PacketWriter packet(kCode, time, 23 + 14 * count);
    packet.u8(22, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 23 + 14 * i;
        packet.u16(record, fingers[i].pnOffset.value_or(65535));
        if (fingers[i].pnOffset)
            packet.u16(record + 6, steps(ratioOf(fingers[i].carrierToInterference), 0, 1.0 / 512));
    }
    return packet.take();
}

} // namespace orvex::korat
