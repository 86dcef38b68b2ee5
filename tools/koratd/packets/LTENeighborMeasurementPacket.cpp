#include "LTENeighborMeasurementPacket.h"

#include "PacketWriter.h"

#include <algorithm>

namespace orvex::korat {

LogMessage LTENeighborMeasurementPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(cells.size(), kLargestCount);

    PacketWriter packet(kCode, time, 21 + 20 * std::max<std::size_t>(count, 1));
    packet.u8(13, version);
    packet.u16(17, earfcn);
    packet.bits(19, 0, 6, steps(qRxLevMin, -140, 2));
    packet.bits(19, 6, 5, static_cast<std::int64_t>(count) - 1);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 21 + 20 * i;
        const Cell& cell = cells[i];
        packet.bits(record, 0, 9, cell.physicalCellID);
        packet.bits(record, 9, 8, steps(cell.rssi, -140, 0.5));
        packet.bits(record, 17, 9, steps(cell.rsrp, -140, 0.5));
        packet.bits(record, 32, 9, steps(cell.averageRSRP, -140, 0.5));
        packet.bits(record, 41, 7, steps(cell.rsrq, -30, 0.25));
        packet.bits(record, 48, 7, steps(cell.averageRSRQ, -30, 0.25));
        packet.bits(record, 55, 7, steps(cell.sRxLev, -30, 1));
        packet.u16(record + 8, cell.frequencyOffset);
        packet.bits(record, 96, 11, cell.frameOffset);
        packet.bits(record, 107, 19, cell.sampleOffset);
    }
    return packet.take();
}

} // namespace orvex::korat
