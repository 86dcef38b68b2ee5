#include "WCDMASearcherPacket.h"

#include "PacketWriter.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
std::int64_t linear(const std::optional<double>& decibels)
{
    return decibels ? steps(std::pow(10, *decibels / 10), 0, 1.0 / 524288) : 0;
}
} // namespace

LogMessage WCDMASearcherPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(cells.size(), kLargestCount);

    PacketWriter packet(kCode, time, 16 + (15 + 44) * count);
    packet.s16(13, steps(rssi, -106, 0.1) - 512);
    packet.u8(15, static_cast<std::int64_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t cell = 16 + 15 * i;
        packet.bits(cell + 7, 0, 13, cells[i].scramblingCode);
        packet.bits(cell + 7, 13, 3, static_cast<int>(cells[i].set));
        const std::size_t ecIo = 16 + 15 * count + 44 * i;
        for (std::size_t k = 0; k < cells[i].ecIo.size(); ++k)
            packet.u32(ecIo + 32 + 4 * k, linear(cells[i].ecIo[k]));
    }
    return packet.take();
}

} // namespace orvex::korat
