// Decoders of the forward and reverse link's data rates.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

std::string littleEndian(std::uint32_t value)
{
    return text("%08X", __builtin_bswap32(value));
}

// One packet counter that stands for 128 bits, the others at zero.
Bytes forward(std::uint32_t sequence, std::uint32_t packets)
{
    return packetOfText("1192: " + littleEndian(sequence) + littleEndian(packets) + " 00*220");
}
Bytes reverse(std::uint32_t sequence, std::uint32_t packets)
{
    return packetOfText("127E: EE " + littleEndian(sequence) + littleEndian(packets) + " 00*1728");
}

struct Link {
    const char* prefix;
    Bytes (*packet)(std::uint32_t sequence, std::uint32_t packets);
};
constexpr Link kLinks[] = {{"FL", forward}, {"RL", reverse}};

TEST(DataRate, CoversTheTimeSinceThePreviousPacket)
{
    const struct {
        const char* name;
        std::uint32_t sequence;
        std::uint32_t packets;
        const char* rate;
    } steps[] = {
        {"first", 10, 0, ""},
        {"two steps on", 12, 64, "4.00 kbps"},
        {"rounded", 15, 65, "0.04 kbps"},
        {"same sequence number", 15, 165, "0.04 kbps"},
        {"backwards", 13, 265, "0.04 kbps"},
        {"since the packet that showed none", 14, 273, "1.00 kbps"},
        {"fewer packets", 16, 173, "-6.25 kbps"},
        {"half the range on, as a step back", 0x80000010, 500, "-6.25 kbps"},
        {"to the last", 0xFFFFFFFF, 532, "0.00 kbps"},
        {"wrapped", 1, 548, "1.00 kbps"},
        {"counter at its highest", 2, 0xFFFFFFFF, "536870843.38 kbps"},
    };
    for (const Link& link : kLinks) {
        C2KFixture fixture;
        fixture.state.set("ExtraInfo", Dictionary::make());
        const std::string key = std::string("k") + link.prefix + "DataRate";
        for (const auto& [name, sequence, packets, rate] : steps) {
            fixture.feed(link.packet(sequence, packets));
            EXPECT_EQ((*fixture.display)[key], Value(rate)) << link.prefix << ": " << name;
        }
    }
}

TEST(DataRate, CountersGoIntoStateAndSnapshot)
{
    for (const Link& link : kLinks) {
        C2KFixture fixture;
        fixture.state.set("ExtraInfo", Dictionary::make());
        fixture.feed(link.packet(0xFFFFFFFE, 1));
        fixture.feed(link.packet(0xFFFFFFFE, 3)); // without a rate too
        const auto named = [&link](const char* name) { return link.prefix + std::string(name); };
        EXPECT_EQ(*fixture.state["ExtraInfo"].dictionary(),
            Dictionary({{named("DataSeqNum1"), -2}, {named("DataSent1"), 384}, {named("DataSeqNum2"), -2},
                {named("DataSent2"), 128}}));
        EXPECT_EQ(fixture.state[named("DataSeqNum")], Value(-2));
        EXPECT_EQ(fixture.state[named("DataSent")], Value(384));
    }
}

TEST(DataRate, WeighsEachCounterByItsPacketSize)
{
    Bytes flat = forward(1, 0);
    for (std::size_t format = 0; format < 56; ++format)
        flat[17 + 4 * format] = static_cast<std::uint8_t>(format + 1);
    C2KFixture fixture;
    fixture.feed(flat);
    EXPECT_EQ(fixture.state["FLDataSent"], Value(1886592));

    // Every number has a value of its own, those between the counters included.
    Bytes mixed = reverse(1, 0);
    for (std::size_t offset = 18; offset + 4 <= mixed.size(); offset += 4)
        for (std::size_t i = 0; i < 2; ++i)
            mixed[offset + i] = static_cast<std::uint8_t>(offset * offset % 9973 >> 8 * i);
    fixture.feed(mixed);
    EXPECT_EQ(fixture.state["RLDataSent"], Value(4919904768));

    fixture.feed(packetOfText("1192: @17 FF*224"));
    EXPECT_EQ(fixture.state["FLDataSent"], Value(std::int64_t{48896} * 0xFFFFFFFF)) << "beyond 32 bits";
}

} // namespace
} // namespace orvex::test
