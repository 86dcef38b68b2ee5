// What the data rates are counted from. The rates themselves are cases of MRL_CDMA.txt.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

TEST(DataRate, CountersGoIntoStateAndSnapshot)
{
    // A second packet of the same sequence number is without a rate.
    const std::tuple<std::string, const char*, const char*> links[] = {
        {"FL", "1192: FEFFFFFF 01000000 00*220", "1192: FEFFFFFF 03000000 00*220"},
        {"RL", "127E: EE FEFFFFFF 01000000 00*1728", "127E: EE FEFFFFFF 03000000 00*1728"},
    };
    for (const auto& [prefix, first, second] : links) {
        C2KFixture fixture;
        fixture.state.set("ExtraInfo", Dictionary::make());
        fixture.feed(packetOfText(first));
        fixture.feed(packetOfText(second));
        EXPECT_EQ(*fixture.state["ExtraInfo"].dictionary(),
            Dictionary({{prefix + "DataSeqNum1", -2}, {prefix + "DataSent1", 384},
                {prefix + "DataSeqNum2", -2}, {prefix + "DataSent2", 128}}));
        EXPECT_EQ(fixture.state[prefix + "DataSeqNum"], Value(-2));
        EXPECT_EQ(fixture.state[prefix + "DataSent"], Value(384));
    }
}

TEST(DataRate, WeighsEachCounterByItsPacketSize)
{
    Bytes flat = packetOfText("1192: 00*228");
    for (std::size_t format = 0; format < 56; ++format)
        flat[17 + 4 * format] = static_cast<std::uint8_t>(format + 1);
    C2KFixture fixture;
    fixture.feed(flat);
    EXPECT_EQ(fixture.state["FLDataSent"], Value(1886592));

    // Every number has a value of its own, those between the counters included.
    Bytes mixed = packetOfText("127E: EE 00*1736");
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
