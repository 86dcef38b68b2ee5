#include "C2KFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

Bytes identityPacket(std::size_t length, Bytes roaming = {1, 0, 0, 0}, Bytes systemType = {2, 0, 0, 0})
{
    return packetWith(0x134F, length,
        {{13, {2}}, {42, std::move(roaming)}, {46, std::move(systemType)}, {50, {0x02, 0x01}},
            {52, {0x04, 0x03}}, {131, {200}}, {133, {7}}, {184, {0x06, 0x05}}});
}

TEST(OneXSystemIdentity, ReadsEachFieldFromItsOwnBytes)
{
    C2KFixture fixture;
    EXPECT_EQ(fixture.rowsAfter(identityPacket(186)),
        (RowTexts{{"k1xRoamingHome", "ON [1]"}, {"kSystemId", "258"}, {"kNetworkId", "772"},
            {"kPacketZoneId", "200"}, {"kBaseId", "1286"}, {"kProtocolRevision", "7"}}));
    const auto foreign = fixture.rowsAfter(identityPacket(186, {1, 0, 0, 0}, {3, 0, 0, 0x80}));
    EXPECT_EQ(textOf(foreign, "kSystemId"), "(unknown system type -2147483645)");
    EXPECT_EQ(textOf(foreign, "kNetworkId"), "(unknown system type -2147483645)");
    for (const std::size_t length : {171U, 184U, 185U})
        EXPECT_EQ(fixture.textAfter(identityPacket(length), "kBaseId"), "(absent)") << length;

    EXPECT_EQ(fixture.log.take(), Lines{});
    EXPECT_EQ(fixture.rowsAfter(packetWith(0x134F, 186, {{13, {1}}})), RowTexts{});
    EXPECT_EQ(fixture.log.take(),
        Lines{"<3>Log code 0x134f has version=1; only version 2 or higher expected; dropping."});
}

TEST(OneXSystemIdentity, NamesRoamingIndicators)
{
    const std::pair<Bytes, const char*> cases[] = {{{0, 0, 0, 0}, "OFF [0]"}, {{1, 0, 0, 0}, "ON [1]"},
        {{2, 0, 0, 0}, "Flashing [2]"}, {{3, 0, 0, 0}, "Out of Neighborhood [3]"},
        {{4, 0, 0, 0}, "Out of Building [4]"}, {{5, 0, 0, 0}, "Preferred system [5]"},
        {{6, 0, 0, 0}, "Available system [6]"}, {{7, 0, 0, 0}, "Alliance partner [7]"},
        {{8, 0, 0, 0}, "Premium partner [8]"}, {{9, 0, 0, 0}, "Full service functionality [9]"},
        {{10, 0, 0, 0}, "Partial service functionality [10]"}, {{11, 0, 0, 0}, "Banner ON [11]"},
        {{12, 0, 0, 0}, "Banner OFF [12]"}, {{13, 0, 0, 0}, "ERI - 13"}, {{0, 1, 0, 0}, "ERI - 256"},
        {{0xFF, 0xFF, 0xFF, 0xFF}, "ERI - -1"}};
    C2KFixture fixture;
    for (const auto& [value, text] : cases)
        EXPECT_EQ(fixture.textAfter(identityPacket(186, value), "k1xRoamingHome"), text);
}

} // namespace
} // namespace orvex::test
