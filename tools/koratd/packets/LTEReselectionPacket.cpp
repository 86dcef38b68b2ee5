#include "LTEReselectionPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

namespace {
std::uint8_t lowByte(int value)
{
    return static_cast<std::uint8_t>(value & 0xFF);
}
std::uint8_t highByte(int value)
{
    return lowByte(value >> 8);
}
} // namespace

auto LTEReselectionPacket::Candidate::makeLTE(int priority, int earfcn, int physicalCellID) -> Candidate
{
    const int cell = physicalCellID << 7;
    return {priority, Technology::lte, {lowByte(earfcn), highByte(earfcn), lowByte(cell), highByte(cell)}};
}

auto LTEReselectionPacket::Candidate::makeUTRAN(int priority, int uarfcn, int scramblingCode) -> Candidate
{
    return {priority, Technology::utran,
        {lowByte(uarfcn), highByte(uarfcn), lowByte(scramblingCode), highByte(scramblingCode)}};
}

auto LTEReselectionPacket::Candidate::makeGERAN(int priority, int arfcn, int band, int bsic) -> Candidate
{
    return {priority, Technology::geran, {lowByte(arfcn), highByte(arfcn), lowByte(band), lowByte(bsic)}};
}

auto LTEReselectionPacket::Candidate::makeCDMA(
    Technology technology, int priority, int band, int channel, int pilot) -> Candidate
{
    return {priority, technology,
        {lowByte(band), 0, 0, 0, lowByte(channel), highByte(channel), lowByte(pilot), highByte(pilot)}};
}

LogMessage LTEReselectionPacket::message(Microseconds time) const
{
    const std::size_t details = candidates.empty() ? 0 : candidates.front().details.size();
    PacketWriter packet(kCode, time, 21 + 4 * candidates.size() + details);
    packet.u8(13, version);
    packet.u16(15, servingEARFCN);
    packet.u16(17, servingCellID);
    packet.u16(19, static_cast<std::int64_t>(candidates.size()));
    for (std::size_t i = 0; i < candidates.size(); ++i) {
        const std::size_t header = 21 + 4 * i;
        packet.u16(header, candidates[i].priority);
        packet.u16(header + 2, static_cast<int>(candidates[i].technology));
        packet.copy(header + 4, candidates[i].details);
    }
    return packet.take();
}

} // namespace orvex::korat
