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

    RecordingLog log;
    auto array = Array::make({"old"});
    index.first.updateSectionRef(array);
    EXPECT_EQ(log.take(), std::vector<std::string>{"<4>One"});
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
    // The lowest ratio of each band, what it yields, and what the ratio below it yields.
    const struct {
        std::uint32_t lowest;
        int decibel;
        int below;
    } bands[] = {{524288, 0, -1}, {417648, -1, -2}, {331809, -2, -3}, {263625, -3, -4}, {209464, -4, -5},
        {166442, -5, -6}, {132269, -6, -7}, {105124, -7, -8}, {83563, -8, -9}, {66436, -9, -10},
        {52831, -10, -11}, {42024, -11, -12}, {33441, -12, -13}, {26622, -13, -14}, {21206, -14, -15},
        {16904, -15, -16}, {13487, -16, -17}, {10772, -17, -18}, {8616, -18, -19}, {6903, -19, -20},
        {5543, -20, -21}, {4462, -21, -22}, {3604, -22, -23}, {2922, -23, -24}, {2241, -24, -25},
        {1950, -25, -26}, {1608, -26, -27}, {1337, -27, -28}, {1121, -28, -29}, {950, -29, -30},
        {814, -30, -31}, {757, -31, -31}, {706, -31, 0}};
    for (const auto& [lowest, decibel, below] : bands) {
        EXPECT_EQ(Base::lookUpECNO(lowest), decibel) << lowest;
        EXPECT_EQ(Base::lookUpECNO(lowest - 1), below) << lowest - 1;
    }
    EXPECT_EQ(Base::lookUpECNO(4294967295), 0);
    EXPECT_EQ(Base::lookUpECNO(0), 0);
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
