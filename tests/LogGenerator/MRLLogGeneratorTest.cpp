#include "MRLLogGenerator.h"
#include "MTLDLFAddVersionReport.h"

#include "GeneratorFixture.h"
#include "PacketText.h"

#include "TextFormat.h"

namespace orvex::test {
namespace {

class ProbeGenerator final : public MRLLogGenerator {
public:
    using MRLLogGenerator::MRLLogGenerator;
    DictionaryRef getStartCommand() const override { return nullptr; }
    void updateState(Dictionary&, ByteView data) override { _binData->append(data); }
    Value generateLogUsingState(Dictionary& state) override
    {
        handOverBinData(state);
        updateHistoryInState(state, environment().clock);
        return {};
    }
};

class MRLLogGeneratorTest : public GeneratorFixture {
public:
    Bytes dlfOf(const Dictionary& from, std::optional<std::string> version = "1.0") const
    {
        auto dlf = ProbeGenerator({resources, clock, std::move(version)}).generateDlfFromState(from);
        return dlf ? *Value(std::move(*dlf)).data() : Bytes();
    }
};

std::string textAt(const Bytes& bytes, std::ptrdiff_t offset, std::ptrdiff_t width)
{
    return {bytes.begin() + offset, bytes.begin() + offset + width};
}

TEST_F(MRLLogGeneratorTest, OpensWithTheVersionReport)
{
    clock.zone = {-12600, true};
    const Bytes dlf = dlfOf({});
    const Bytes expected =
        bytesOfWords("A100 FD1F 00*8 01 00 01 00 4F7276657820 00 " // "Orvex "
                     "45584543555441424C455F4E414D45 00*25 "       // "EXECUTABLE_NAME"
                     "446563203139203230313820 32333A3539 00 "     // "Dec 19 2018 23:59"
                     "00F15365 2EFF 01 00*73"); // 1700000000, -210 minutes, daylight saving
    EXPECT_EQ(dlf, expected);

    EXPECT_EQ(textAt(dlfOf({}, std::nullopt), 16, 7), std::string("(none)\0", 7));
    clock.zone = {-59, false};
    EXPECT_EQ(textAt(dlfOf({}), 85, 4), std::string(4, '\0')) << "truncated toward zero";
}

TEST_F(MRLLogGeneratorTest, SaveContentsAreTheHistoryAndTheDLF)
{
    const ProbeGenerator generator({resources, clock, {}});
    EXPECT_EQ(
        shown(*generator.getSaveContentsFromState({})), "Description=DLF binary (161 bytes), DLF=(data)");

    const auto history = Array::make({Dictionary::make({{"DisplayState", std::make_shared<Bytes>(5)}}),
        Dictionary::make({{"DisplayState", "not bytes"}})});
    RecordingLog log;
    EXPECT_EQ(*generator.getSaveContentsFromState({{"History", history}}), *history) << "no partial DLF";
    EXPECT_EQ(log.take(), Lines{"<16>Got wrong class writing history to DLF; aborting writing the DLF file"});
    history->removeFirst(1);
    (*history)[0].dictionary()->remove("DisplayState");
    EXPECT_EQ(generator.getSaveContentsFromState({{"History", history}})->size(), 2U);
    EXPECT_EQ(history->size(), 1U) << "the history itself is left alone";
}

// The sizes of the raw packets in each history entry, oldest first.
std::vector<std::size_t> sizesOf(const Array& history)
{
    std::vector<std::size_t> sizes;
    for (const Value& entry : history)
        sizes.push_back((*entry.dictionary())["DisplayState"].data()->size());
    return sizes;
}

TEST_F(MRLLogGeneratorTest, RawPacketsStayWithinTheirLimit)
{
    using Sizes = std::vector<std::size_t>;
    const Lines full = {"<4>The raw packets since the last refresh exceed 80 bytes, dropping the oldest"};
    const auto aged = [](int bytes) {
        return Lines{text("<4>The history dropped its oldest raw packets, %d bytes", bytes)};
    };
    // How many packets of 4 bytes arrive in an interval, and what is kept then.
    const std::tuple<int, Sizes, Lines> intervals[] = {
        {5, {20}, {}},
        {15, {20, 60}, {}}, // the limit
        {3, {0, 60, 12}, aged(20)},
        {20, {0, 0, 0, 80}, aged(72)},
        {21, {0, 0, 0, 0, 76}, {full[0], aged(80)[0]}},
        {50, {0, 0, 0, 0, 80}, {full[0], aged(76)[0]}},
        {0, {0, 0, 0, 80, 0}, {}},
    };
    const GeneratorEnvironment limited{
        .resources = resources, .clock = clock, .buildVersion = {}, .rawPacketLimit = 80};
    ProbeGenerator generator(limited);
    RecordingLog log;
    std::uint8_t number = 0;
    for (const auto& [packets, kept, lines] : intervals) {
        for (int i = 0; i < packets; ++i)
            generator.updateState(state, Bytes{1, 2, 3, ++number});
        generator.generateLogUsingState(state);
        const Array& history = *state["History"].array();
        EXPECT_EQ(sizesOf(history), kept) << packets;
        EXPECT_EQ(log.take(), lines) << packets;
        const Bytes& newest = *state["DisplayState"].data();
        EXPECT_TRUE(newest.empty() || (newest[0] == 1 && newest.back() == number)) << packets;
    }
    generator.updateState(state, Bytes(81)); // longer than the limit: nothing fits beside it, nor does it
    generator.generateLogUsingState(state);
    EXPECT_TRUE(state["DisplayState"].data()->empty());

    ProbeGenerator keepsNone({resources, clock, {}, 0});
    log.take();
    keepsNone.updateState(state, Bytes(5));
    keepsNone.generateLogUsingState(state);
    EXPECT_TRUE(state["DisplayState"].data()->empty());
}

TEST(MTLDLFAddVersionReport, NeedsRoomForAllOfIt)
{
    Bytes buffer(161, 0x55);
    std::uint32_t written = 99;
    EXPECT_EQ(MTLDLFAddVersionReport(buffer.data(), 160, written, 1, 2, "v", "e", "d", {}), 3U);
    EXPECT_EQ(written, 0U);
    EXPECT_EQ(buffer, Bytes(161, 0x55));
    const char* longVersion = "1234567"; // its last character has no room
    EXPECT_EQ(MTLDLFAddVersionReport(buffer.data(), 161, written, 258, 772, longVersion, "e", "d", {}), 0U);
    EXPECT_EQ(written, 161U);
    EXPECT_EQ(textAt(buffer, 12, 13),
        std::string("\2\1\4\3"
                    "123456\0e",
            13));
}

} // namespace
} // namespace orvex::test
