#include "Base.h"
#include "ClassIndex.h"
#include "RecordList.h"

#include "RecordingLog.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

class ProbeSection final : public Base {
public:
    ProbeSection(
        const char* name, std::vector<LogCode> codes, ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(name, std::move(codes), dict, codeDict)
    {
    }
    void updateWithData(Packet, LogCode) override { replaceSection(Array({"new"})); }
};

class ProbeIndex final : public ClassIndex {
public:
    ProbeSection first{"One", {16662, 16662}, _classDict, _codeDictionary};
    ProbeSection second{"Two", {kExtraCodeSimFiles, 16662}, _classDict, _codeDictionary};
    ProbeSection namesake{"One", {7}, _classDict, _codeDictionary};
};

TEST(ClassIndex, KeepsSectionsByNameAndSubscribersInOrder)
{
    RecordingLog log;
    const ProbeIndex index;
    EXPECT_EQ(log.take(),
        (std::vector<std::string>{"<4>Array Count: 2", "<4>Array Count: 2", "<4>Array Count: 1"}));
    EXPECT_EQ(index.getClass("One"), &index.namesake) << "the later of two";
    EXPECT_EQ(index.getClass("Three"), nullptr);
    ASSERT_NE(index.getSubscribers(16662), nullptr);
    const std::vector<const Base*> subscribers(
        index.getSubscribers(16662)->begin(), index.getSubscribers(16662)->end());
    EXPECT_EQ(subscribers, (std::vector<const Base*>{&index.first, &index.first, &index.second}));
    EXPECT_EQ(index.getSubscribers(8), nullptr);
    EXPECT_EQ(index.getAllLogCodes(), (std::vector<std::string>{"16662", "16711680", "7"}));
}

TEST(Base, WritesOnlyIntoAContainerThatIsBoundAlive)
{
    ProbeIndex index;
    const LogCode code = 16662;
    index.first.updateWithData({}, code); // nothing is bound

    auto array = Array::make({"old"});
    index.first.updateSectionRef(array);
    index.first.updateWithData({}, code);
    EXPECT_EQ(*array, Array({"new"}));

    const auto dictionary = Dictionary::make();
    index.first.updateSectionRef(dictionary);
    index.first.updateWithData({}, code);
    EXPECT_TRUE(dictionary->isEmpty()) << "a dictionary is no place for a list";
    EXPECT_EQ(*array, Array({"new"}));

    index.first.updateSectionRef(array);
    array.reset();
    index.first.updateWithData({}, code); // the display is gone
}

TEST(Base, LooksUpEcNoInTheMeasuredBands)
{
    const struct {
        std::uint32_t ratio;
        int decibel;
    } cases[] = {{4294967295, 0}, {524288, 0}, {524287, -1}, {417648, -1}, {417647, -2}, {331808, -3},
        {209464, -4}, {166441, -6}, {105124, -7}, {66435, -10}, {42024, -11}, {33440, -13}, {21206, -14},
        {16903, -16}, {10772, -17}, {8615, -19}, {5543, -20}, {4461, -22}, {2922, -23}, {2921, -24},
        {2241, -24}, {2240, -25}, {1950, -25}, {1607, -27}, {1121, -28}, {949, -30}, {814, -30}, {813, -31},
        {757, -31}, {756, -31}, {706, -31}, {705, 0}, {0, 0}};
    for (const auto& [ratio, decibel] : cases)
        EXPECT_EQ(Base::lookUpECNO(ratio), decibel) << ratio;
}

TEST(PacketReader, ReadsStayInsideThePacket)
{
    const Bytes bytes = {0x01, 0x82, 0xFF, 0x7F, 0x80};
    const PacketReader reader(bytes);
    EXPECT_EQ(reader.u16(0), 0x8201);
    EXPECT_EQ(reader.s16(0), -32255);
    EXPECT_EQ(reader.s32(1), static_cast<std::int32_t>(0x807FFF82));
    EXPECT_EQ(reader.u32(2), 0U) << "one byte beyond";
    EXPECT_EQ(reader.u8(5), 0);
    EXPECT_EQ(reader.u16(static_cast<std::size_t>(-1)), 0) << "an offset that wraps";
    EXPECT_EQ(reader.bits(0, 7, 3), 4U) << "across two bytes";
    EXPECT_EQ(reader.bits(0, 1, 32), 0x3FFFC100U) << "32 bits across five bytes";
    EXPECT_EQ(reader.bits(0, 9, 32), 0U) << "the last bit beyond";
    EXPECT_EQ(reader.bits(4, 7, 1), 1U) << "the very last bit";
    EXPECT_EQ(reader.bits(4, 8, 1), 0U);
}

} // namespace
} // namespace orvex::test
