#include "Base.h"
#include "C2K/OneXStatus.h"
#include "ClassIndex.h"
#include "LTE/ReselectionCandidates.h"
#include "PacketReader.h"
#include "UTRAN/TransportChannels.h"

#include "PacketText.h"
#include "RecordingLog.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

using namespace std::string_literals;

class ProbeSection final : public Base {
public:
    ProbeSection(
        const char* name, std::vector<LogCode> codes, ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(name, std::move(codes), dict, codeDict)
    {
    }
    void updateWithData(Packet, LogCode) override { replaceArray(array(), Array({"new"})); }
};

class ProbeIndex final : public ClassIndex {
public:
    ProbeSection first{"One", {16662, 16662}, _classDict, _codeDictionary};
    ProbeSection second{"Two", {kExtraCodeSimFiles, 16662}, _classDict, _codeDictionary};
    ProbeSection namesake{"One", {7}, _classDict, _codeDictionary};
};

TEST(ClassIndex, KeepsTheLaterOfTwoSectionsOfOneNameAndEverySubscription)
{
    RecordingLog log;
    ProbeIndex index;
    EXPECT_EQ(log.take(), std::vector({"<4>Array Count: 2"s, "<4>Array Count: 2"s, "<4>Array Count: 1"s}));
    EXPECT_EQ(index.getClass("One"), &index.namesake);
    EXPECT_EQ(*index.getSubscribers(16662), std::vector<Base*>({&index.first, &index.first, &index.second}));
    EXPECT_EQ(index.getAllLogCodes(), std::vector({"16662"s, "16711680"s, "7"s}));
}

TEST(Base, WritesOnlyWhileAContainerOfItsKindIsBound)
{
    ProbeIndex index;
    index.first.updateWithData({}, 7); // nothing is bound
    auto array = Array::make({"old"});
    index.first.updateSectionRef(array);
    index.first.updateWithData({}, 7);
    EXPECT_EQ(*array, Array({"new"}));
    index.first.updateSectionRef(Dictionary::make());
    index.first.updateWithData({}, 7); // which is no place for a list
    index.first.updateSectionRef(array);
    array.reset();
    index.first.updateWithData({}, 7); // the display is gone
}

TEST(Base, LooksUpEcNoInTheMeasuredBands)
{
    // The lowest ratios of 0 dB, -1 dB and so on. What is left below the last of them counts as -31 dB too.
    const std::uint32_t lowest[] = {524288, 417648, 331809, 263625, 209464, 166442, 132269, 105124, 83563,
        66436, 52831, 42024, 33441, 26622, 21206, 16904, 13487, 10772, 8616, 6903, 5543, 4462, 3604, 2922,
        2241, 1950, 1608, 1337, 1121, 950, 814, 757};
    int decibel = 0;
    for (const std::uint32_t ratio : lowest) {
        EXPECT_EQ(Base::lookUpECNO(ratio), decibel) << ratio;
        decibel = std::max(decibel - 1, -31);
        EXPECT_EQ(Base::lookUpECNO(ratio - 1), decibel) << ratio;
    }
    EXPECT_EQ(Base::lookUpECNO(4294967295), 0);
    EXPECT_EQ(Base::lookUpECNO(706), -31);
    EXPECT_EQ(Base::lookUpECNO(705), 0);
}

TEST(RecordList, ThrowsBeyondItsCount)
{
    const Bytes channels = packetOfText("D00C: 00 6:0 6:2 4:1 @400");
    EXPECT_THROW(LogCode_0xD00C(channels).transportChannels()[2], ArrayOutOfBoundsException);
    EXPECT_THROW(LogCode_0xD00C(channels).compositeChannels()[0].sir(6), ArrayOutOfBoundsException);
    const Bytes gsm = packetOfText("B186: @19 0100 0000 0200 00000000");
    EXPECT_THROW(LogCode_0xB186(gsm).candidates()[0].lteFields(), ArrayOutOfBoundsException);
    const Bytes set = bytesOfWords("03 EE 7800 0100 01 00 01 00 0000 0700 00*108");
    EXPECT_THROW(LogCode_0x119C_ActiveSet(Subpacket(PacketReader(set))).pilot(1), ArrayOutOfBoundsException);
}

TEST(PacketReader, ReadsStayInsideThePacket)
{
    const Bytes bytes = {0x01, 0x82, 0xFF, 0x7F, 0x80};
    const PacketReader reader(bytes);
    EXPECT_EQ(reader.s32(1), static_cast<std::int32_t>(0x807FFF82));
    EXPECT_EQ(reader.u32(2), 0U) << "one byte beyond";
    EXPECT_EQ(reader.u16(static_cast<std::size_t>(-1)), 0) << "an offset that wraps";
    EXPECT_EQ(reader.bits(0, 7, 3), 4U) << "across two bytes";
    EXPECT_EQ(reader.bits(0, 1, 32), 0x3FFFC100U) << "32 bits across five bytes";
    EXPECT_EQ(reader.bits(0, 9, 32), 0U) << "the last bit beyond";
    EXPECT_EQ(reader.bits(4, 7, 1), 1U) << "the very last bit";
}

} // namespace
} // namespace orvex::test
