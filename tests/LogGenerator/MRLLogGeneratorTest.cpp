#include "MRLLogGenerator.h"
#include "MTLDLFAddVersionReport.h"

#include "Array.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "RecordingLog.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

class ProbeGenerator final : public MRLLogGenerator {
public:
    using MRLLogGenerator::MRLLogGenerator;
    DictionaryRef getStartCommand() const override { return nullptr; }
    void updateState(Dictionary&, ByteView) override { }
    Value generateLogUsingState(Dictionary&) override { return {}; }
};

class MRLLogGeneratorTest : public testing::Test {
public:
    Bytes dlfOf(const Dictionary& state, std::optional<std::string> version = "1.0") const
    {
        const auto dlf = ProbeGenerator({resources, clock, std::move(version)}).generateDlfFromState(state);
        return dlf ? *dlf : Bytes();
    }

    FixedResources resources;
    FixedClock clock;
};

std::string textAt(const Bytes& bytes, std::size_t offset, std::size_t width)
{
    return {bytes.begin() + static_cast<std::ptrdiff_t>(offset),
        bytes.begin() + static_cast<std::ptrdiff_t>(offset + width)};
}

TEST_F(MRLLogGeneratorTest, OpensWithTheVersionReport)
{
    clock.zone = {-12600, true};
    const Bytes dlf = dlfOf({});
    Bytes expected(161);
    const auto put = [&expected](std::size_t offset, const Bytes& bytes) {
        std::ranges::copy(bytes, expected.begin() + static_cast<std::ptrdiff_t>(offset));
    };
    put(0, {0xA1, 0x00, 0xFD, 0x1F});
    put(12, {1, 0, 1, 0});
    put(16, {'O', 'r', 'v', 'e', 'x', ' '});
    put(23, {'E', 'X', 'E', 'C', 'U', 'T', 'A', 'B', 'L', 'E', '_', 'N', 'A', 'M', 'E'});
    put(63, {'D', 'e', 'c', ' ', '1', '9', ' ', '2', '0', '1', '8', ' ', '2', '3', ':', '5', '9'});
    put(81, {0x00, 0xF1, 0x53, 0x65}); // 1700000000, the fraction dropped
    put(85, {0x2E, 0xFF});             // -210 minutes
    put(87, {1});
    EXPECT_EQ(dlf, expected);

    EXPECT_EQ(textAt(dlfOf({}, std::nullopt), 16, 7), std::string("(none)\0", 7));
    clock.zone = {20700, false};
    EXPECT_EQ(textAt(dlfOf({}), 85, 4), std::string("\x59\x01\x00\x00", 4)) << "UTC+05:45";
    clock.zone = {-59, false};
    EXPECT_EQ(textAt(dlfOf({}), 85, 2), std::string("\0\0", 2)) << "truncated toward zero";
}

TEST_F(MRLLogGeneratorTest, AppendsTheHistoryWithoutTheFirstByteOfEachEntry)
{
    const auto entry = [](const Bytes& packets) {
        return Dictionary::make({{"DisplayState", std::make_shared<Bytes>(packets)}});
    };
    const Dictionary state{{"History",
        Array::make({entry({1, 2, 3}), entry({9}), entry({}), Dictionary::make(), entry({1, 4})})}};
    const Bytes dlf = dlfOf(state);
    EXPECT_EQ(Bytes(dlf.begin() + 161, dlf.end()), (Bytes{2, 3, 4}));
}

TEST_F(MRLLogGeneratorTest, SaveContentsAreTheHistoryAndTheDLF)
{
    const ProbeGenerator generator({resources, clock, {}});
    const auto alone = generator.getSaveContentsFromState({});
    ASSERT_EQ(alone->size(), 1U);
    EXPECT_EQ((*(*alone)[0].dictionary())["Description"], Value("DLF binary (161 bytes)"));
    EXPECT_EQ((*(*alone)[0].dictionary())["DLF"].data()->size(), 161U);

    const auto history = Array::make({Dictionary::make({{"DisplayState", std::make_shared<Bytes>(5)}}),
        Dictionary::make({{"DisplayState", "not bytes"}})});
    RecordingLog log;
    const auto broken = generator.getSaveContentsFromState({{"History", history}});
    EXPECT_EQ(*broken, *history) << "no partial DLF";
    EXPECT_EQ(log.take(),
        std::vector<std::string>{
            "<16>Got wrong class writing history to DLF; aborting writing the DLF file"});
    EXPECT_EQ(history->size(), 2U) << "the history itself is left alone";
}

TEST(MTLDLFAddVersionReport, NeedsRoomForAllOfIt)
{
    Bytes buffer(161, 0x55);
    std::uint32_t written = 99;
    EXPECT_EQ(MTLDLFAddVersionReport(buffer.data(), 160, written, 1, 2, "v", "e", "d", {}), 3U);
    EXPECT_EQ(written, 0U);
    EXPECT_EQ(buffer, Bytes(161, 0x55));
    EXPECT_EQ(
        MTLDLFAddVersionReport(buffer.data(), 161, written, 0x0102, 0x0304, "1234567", "e", "d", {}), 0U);
    EXPECT_EQ(written, 161U);
    EXPECT_EQ(Bytes(buffer.begin() + 12, buffer.begin() + 26),
        (Bytes{0x02, 0x01, 0x04, 0x03, '1', '2', '3', '4', '5', '6', 0, 'e', 0, 0}));
}

} // namespace
} // namespace orvex::test
