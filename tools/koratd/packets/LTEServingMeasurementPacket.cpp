#include "LTEServingMeasurementPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

namespace {
constexpr std::size_t kBits = 19;
constexpr int kNoPMax = 64;
constexpr int kNoSearchThreshold = 32;

std::int64_t searchSteps(const std::optional<int>& threshold)
{
    return threshold ? steps(*threshold, 0, 2) : kNoSearchThreshold;
}
} // namespace

LogMessage LTEServingMeasurementPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 33);
    packet.u8(13, version);
    packet.u16(17, earfcn);
    packet.bits(kBits, 0, 9, physicalCellID);
    packet.bits(kBits, 9, 4, layerPriority);
    packet.bits(kBits, 16, 9, steps(rsrp, -140, 0.25));
    packet.bits(kBits, 25, 9, steps(averageRSRP, -140, 0.25));
    packet.bits(kBits, 34, 7, steps(rsrq, -30, 0.25));
    packet.bits(kBits, 41, 7, steps(averageRSRQ, -30, 0.25));
    packet.bits(kBits, 48, 9, steps(rssi, -140, 0.5));
    packet.bits(kBits, 57, 6, steps(qRxLevMin, -140, 2));
    packet.bits(kBits, 63, 7, pMax ? steps(*pMax, -30, 1) : kNoPMax);
    packet.bits(kBits, 70, 6, steps(maximumPower, -30, 1));
    packet.bits(kBits, 80, 7, steps(sRxLev, -30, 1));
    packet.bits(kBits, 87, 6, drxCyclesBelowZero);
    packet.bits(kBits, 93, 6, searchSteps(sIntraSearch));
    packet.bits(kBits, 99, 6, searchSteps(sNonIntraSearch));
    packet.bits(kBits, 105, 1, rulesUpdated ? 1 : 0);
    packet.bits(kBits, 106, 4, rules);
    return packet.take();
}

} // namespace orvex::korat
