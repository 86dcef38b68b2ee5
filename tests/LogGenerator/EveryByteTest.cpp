// Packets of every code with other values at each of their first bytes, counts among them: no list is longer
// than its packet.

#include "HostilePackets.h"

#include <numeric>

namespace orvex::test {
namespace {

constexpr std::size_t kBytesTried = 60; // of the payload

class EveryByte : public testing::TestWithParam<const char*> { };

INSTANTIATE_TEST_SUITE_P(, EveryByte, testing::ValuesIn(kMarlinTechnologies),
    [](const auto& each) { return std::string(each.param); });

enum class Values { all, atEdges };

std::vector<std::uint8_t> valuesOf(Values which)
{
    if (which == Values::atEdges)
        return {0, 1, 2, 3, 7, 8, 15, 16, 31, 64, 127, 128, 254, 255};
    std::vector<std::uint8_t> values(256);
    std::iota(values.begin(), values.end(), 0);
    return values;
}

// What the decoder writes into: rows, or a list.
bool writesRows(const Decoder& decoder, const Bytes& packet)
{
    const auto rows = Dictionary::make();
    survives(decoder, rows, packet);
    return !rows->isEmpty();
}

void expectBounds(const Decoder& decoder, const Value& container, std::size_t packetLength)
{
    const auto rows = container.dictionary();
    if (!rows)
        return expectBound(decoder, nullptr, container, packetLength);
    for (const auto& [row, shown] : *rows)
        expectBound(decoder, row.c_str(), shown, packetLength);
}

void tryBytes(const Decoder& decoder, const Bytes& packet, Values which)
{
    const bool isRows = writesRows(decoder, packet);
    const std::size_t end = std::min(packet.size(), kPacketHeaderLength + kBytesTried);
    const auto values = valuesOf(which);
    Bytes changed = packet;
    for (std::size_t offset = kPacketHeaderLength; offset < end; ++offset) {
        for (const std::uint8_t value : values) {
            changed[offset] = value;
            const Value container = isRows ? Value(Dictionary::make()) : Value(Array::make());
            survives(decoder, container, changed);
            if (decoder.code < kExtraCodeBase)
                expectBounds(decoder, container, packet.size());
        }
        changed[offset] = packet[offset];
    }
}

TEST_P(EveryByte, MakesNoListLongerThanThePacket)
{
    const EveryDecoder decoders(GetParam());
    PacketsOfCode packets(GetParam());
    for (const Decoder& decoder : decoders.all()) {
        const auto& all = packets[decoder.code];
        if (decoder.code >= kExtraCodeBase) {
            tryBytes(decoder, all.back(), Values::atEdges); // binary: the other form begins with a heading
            continue;
        }
        for (const Bytes& packet : all)
            tryBytes(decoder, packet, &packet == &all.front() ? Values::all : Values::atEdges);
    }
}

} // namespace
} // namespace orvex::test
