#include "C2KEVDOActiveSetPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage C2KEVDOActiveSetPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(pilots.size(), kLargestCount);

    PacketWriter packet(kCode, time, 25 + 12 * count);
    packet.u8(15, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 25 + 12 * i;
        packet.u16(record, pilots[i].pnOffset);
        packet.u16(record + 2, steps(ratioOf(pilots[i].strength), 0, 1.0 / 512));
    }
    return packet.take();
}

} // namespace orvex::korat
