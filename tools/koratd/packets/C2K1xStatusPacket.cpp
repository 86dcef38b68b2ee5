#include "C2K1xStatusPacket.h"

#include "C2KSubpacketWriter.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
// The searcher: its figures keep strengths from 0 to below -40 dB within the 16 bits of the energy.
constexpr int kChips = 64;
constexpr int kSums = 2;
constexpr int kScale = 2;
constexpr std::size_t kFingersOfPilot = 3;

constexpr std::size_t kSystemLength = 8;
constexpr std::size_t kRadioLength = 16;
constexpr std::size_t kFingersLength = 8;
constexpr std::size_t kPilotLength = (6 * kFingersOfPilot + 15) / 4 * 4;

std::int64_t agcSteps(double dBm)
{
    return steps(dBm, -63.248, 0.334);
}

std::int64_t energySteps(double dB)
{
    const double step = std::exp2(2 * kScale - 3) / (9.0 * kChips * kChips * kSums);
    return steps(ratioOf(dB), -1.0 / kChips, step);
}
} // namespace

LogMessage C2K1xStatusPacket::message(Microseconds time) const
{
    const std::size_t count = std::min(pilots.size(), kLargestCount);

    C2KSubpacketWriter packet(
        kCode, time, {kSystemLength, kRadioLength, 12 + count * kPilotLength, kFingersLength});
    packet.start(1);
    packet.u8(4, static_cast<int>(state));

    packet.start(2);
    packet.u8(4, receivers[0].bandClass);
    packet.u8(5, receivers[1].bandClass);
    packet.u16(6, receivers[0].channel);
    packet.u16(8, receivers[1].channel);
    packet.s8(10, agcSteps(receivers[0].agc));
    packet.s8(11, agcSteps(receivers[1].agc));
    packet.s16(12, steps(transmitAGC, 0, 0.1));

    packet.start(3);
    packet.u16(4, kChips);
    packet.u8(6, kSums);
    packet.u8(7, kScale);
    packet.u8(8, static_cast<std::int64_t>(count));
    packet.u8(9, kFingersOfPilot);
    packet.u16(10, referencePN);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = 12 + i * kPilotLength;
        packet.u16(record, pilots[i].pnOffset);
        packet.u16(record + 12 + 4 * kFingersOfPilot, energySteps(pilots[i].strength));
    }

    packet.start(4);
    return packet.take();
}

} // namespace orvex::korat
