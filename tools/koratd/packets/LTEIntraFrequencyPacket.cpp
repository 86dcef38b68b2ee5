#include "LTEIntraFrequencyPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

namespace {
constexpr std::size_t kLargestCount = 255;

std::int64_t rsrpSteps(double dBm)
{
    return steps(dBm, -140, 0.25);
}
std::int64_t rsrqSteps(double dB)
{
    return steps(dB, -20, 0.125);
}
} // namespace

LogMessage LTEIntraFrequencyPacket::message(Microseconds time) const
{
    const std::size_t n = std::min(neighbors.size(), kLargestCount);
    const std::size_t m = std::min(detectedCells.size(), kLargestCount);

    PacketWriter packet(kCode, time, 29 + 6 * n + 2 * m);
    packet.u16(17, earfcn);
    packet.u16(19, physicalCellID);
    packet.u16(21, subframe);
    packet.u16(23, rsrpSteps(rsrp));
    packet.u16(25, rsrqSteps(rsrq));
    packet.u8(27, static_cast<std::int64_t>(n));
    packet.u8(28, static_cast<std::int64_t>(m));
    for (std::size_t i = 0; i < n; ++i) {
        const std::size_t record = 29 + 6 * i;
        packet.u16(record, neighbors[i].physicalCellID);
        packet.u16(record + 2, rsrpSteps(neighbors[i].rsrp));
        packet.u16(record + 4, rsrqSteps(neighbors[i].rsrq));
    }
    for (std::size_t j = 0; j < m; ++j)
        packet.u16(29 + 6 * n + 2 * j, detectedCells[j]);
    return packet.take();
}

} // namespace orvex::korat
