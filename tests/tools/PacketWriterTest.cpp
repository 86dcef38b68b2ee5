#include "packets/PacketWriter.h"

#include <gmock/gmock.h>

namespace orvex::korat {
namespace {

TEST(PacketWriter, ValuesStayInTheirFieldAndLeaveTheirNeighboursAlone)
{
    PacketWriter packet(kExtraCodeBase + 2, Microseconds{0x0001020304050607}, 13 + 256);
    packet.u8(13, 300);
    packet.u8(14, -5);
    packet.u16(15, 70000);
    packet.s16(17, 40000);
    packet.s16(19, -40000);
    packet.bits(21, 0, 9, 0x1FF);
    packet.bits(21, 9, 4, 0b0101);
    packet.bits(21, 13, 9, 1000); // becomes 511
    packet.bits(21, 25, 3, -1);   // becomes 0
    packet.bits(21, 28, 4, 0b1001);
    packet.bits(21, 0, 9, 0x101); // written anew
    packet.s8(26, 200);
    packet.s8(27, -200);
    const Bytes bytes = packet.take().bytes;
    EXPECT_THAT(Bytes(bytes.begin(), bytes.begin() + 29),
        testing::ElementsAre(255, 0x0C, 0x01, 2, 0, 7, 6, 5, 4, 3, 2, 1, 0, // the length is one short
            255, 0, 0xFF, 0xFF, 0xFF, 0x7F, 0x00, 0x80, 0x01, 0xEB, 0x3F, 0x90, 0, 0x7F, 0x80, 0));
}

TEST(PacketWriter, WritingOutsideThePacketIsAFault)
{
    PacketWriter packet(1, {}, 15);
    EXPECT_THROW(packet.u16(14, 1), std::out_of_range);
    EXPECT_THROW(packet.bits(14, 0, 9, 1), std::out_of_range);
    EXPECT_THROW(packet.copy(13, Bytes(3)), std::out_of_range);
}

} // namespace
} // namespace orvex::korat
