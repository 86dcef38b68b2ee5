#include "UTRANTransportChannelPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage UTRANTransportChannelPacket::message(Microseconds time) const
{
    const std::size_t t = std::min(channels.size(), kLargestChannelCount);
    const std::size_t k = std::min(composites.size(), kLargestCompositeCount);
    const std::size_t firstComposite = 289 + 34 * t;

    PacketWriter packet(kCode, time, firstComposite + 8 * k);
    packet.bits(14, 6, 6, static_cast<std::int64_t>(t));
    packet.bits(14, 12, 4, static_cast<std::int64_t>(k));
    for (std::size_t i = 0; i < t; ++i) {
        packet.u8(17 + 2 * i, channels[i].identity);
        packet.u8(18 + 2 * i, channels[i].blockErrorRate);
    }
    for (std::size_t j = 0; j < k; ++j) {
        const std::size_t record = firstComposite + 8 * j;
        packet.u8(record, composites[j].identity);
        packet.u8(record + 1, composites[j].timeslot);
        for (std::size_t slot = 0; slot < composites[j].sir.size(); ++slot)
            packet.u8(record + 2 + slot, composites[j].sir[slot]);
    }
    return packet.take();
}

} // namespace orvex::korat
