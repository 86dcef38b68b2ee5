#include "WCDMATransmitPowerPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage WCDMATransmitPowerPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(powers.size(), kLargestCount);

    PacketWriter packet(kCode, time, 16 + 14 * count);
    packet.u8(14, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::int64_t power = powers[i] ? steps(*powers[i], -70, 0.1) - 512 : 0;
        // -18.8 dBm would be 0 as well, and is told as a tenth more.
        packet.s16(20 + 14 * i, powers[i] && power == 0 ? 1 : power);
    }
    return packet.take();
}

} // namespace orvex::korat
