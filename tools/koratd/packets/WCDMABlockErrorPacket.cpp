#include "WCDMABlockErrorPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage WCDMABlockErrorPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(channels.size(), kLargestCount);

    PacketWriter packet(kCode, time, 16 + 9 * count);
    packet.u8(13, static_cast<std::int64_t>(count));
    packet.u16(14, windowSize);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 16 + 9 * i;
        packet.u8(record, channels[i].identity);
        packet.s32(record + 1, channels[i].blocks);
        packet.s32(record + 5, channels[i].errors);
    }
    return packet.take();
}

} // namespace orvex::korat
