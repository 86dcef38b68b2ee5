#include "packets/PacketWriter.h"

#include <gmock/gmock.h>

namespace orvex::korat {
namespace {

using testing::ElementsAre;

Bytes payload(const LogMessage& message)
{
    return {message.bytes.begin() + PacketWriter::kHeaderLength, message.bytes.end()};
}

TEST(PacketWriter, HeaderTellsTypeLengthCodeAndTime)
{
    EXPECT_THAT(PacketWriter(0xB179, Microseconds{0x0001020304050607}, 15).take().bytes,
        ElementsAre(1, 14, 0, 0x79, 0xB1, 7, 6, 5, 4, 3, 2, 1, 0, 0, 0));
    const auto extra = PacketWriter(kExtraCodes + 2, Microseconds{1}, 13 + 300).take();
    EXPECT_EQ(extra.code, 0xFF0002U);
    EXPECT_EQ(Bytes(extra.bytes.begin(), extra.bytes.begin() + 6), (Bytes{255, 0x38, 0x01, 2, 0, 1}));
}

TEST(PacketWriter, NumbersAreLittleEndianAndStayInTheirField)
{
    PacketWriter packet(1, {}, 13 + 16);
    packet.u8(13, 300);
    packet.u8(14, -5);
    packet.u16(15, 0x1234);
    packet.u16(17, 70000);
    packet.u32(19, 0x89ABCDEF);
    packet.s16(23, -100);
    packet.s16(25, 40000);
    packet.s16(27, -40000);
    EXPECT_THAT(payload(packet.take()),
        ElementsAre(
            255, 0, 0x34, 0x12, 0xFF, 0xFF, 0xEF, 0xCD, 0xAB, 0x89, 0x9C, 0xFF, 0xFF, 0x7F, 0x00, 0x80));
}

TEST(PacketWriter, BitFieldsCrossBytesAndLeaveTheirNeighboursAlone)
{
    PacketWriter packet(1, {}, 13 + 4);
    packet.bits(13, 0, 9, 0x1FF);
    packet.bits(13, 9, 4, 0b0101);
    packet.bits(13, 13, 9, 1000); // becomes 511
    packet.bits(13, 25, 3, -1);   // becomes 0
    packet.bits(13, 28, 4, 0b1001);
    packet.bits(13, 0, 9, 0x101); // written anew
    EXPECT_THAT(payload(packet.take()), ElementsAre(0x01, 0xEB, 0x3F, 0x90));
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
