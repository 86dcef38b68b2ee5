#include "EquivalentPLMNPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage EquivalentPLMNPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(plmns.size(), kLargestCount);

    PacketWriter packet(kCode, time, 17 + (count > 0 ? 3 * count + 3 : 0));
    packet.u8(16, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        for (std::size_t place = 0; place < 3; ++place) {
            const std::size_t pair = 17 + 3 * i + 2 * place;
            packet.u8(pair, digit(plmns[i].mcc, 2 - static_cast<int>(place)));
            packet.u8(pair + 1, digit(plmns[i].mnc, 2 - static_cast<int>(place)));
        }
    }
    return packet.take();
}

} // namespace orvex::korat
