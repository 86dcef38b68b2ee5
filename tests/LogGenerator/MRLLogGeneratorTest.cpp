#include "MRLLogGenerator.h"
#include "MTLDLFAddVersionReport.h"

#include "GeneratorFixture.h"
#include "PacketText.h"

namespace orvex::test {
namespace {

class ProbeGenerator final : public MRLLogGenerator {
public:
    using MRLLogGenerator::MRLLogGenerator;
    DictionaryRef getStartCommand() const override { return nullptr; }
    void updateState(Dictionary&, ByteView) override { }
    Value generateLogUsingState(Dictionary&) override { return {}; }
};

class MRLLogGeneratorTest : public GeneratorFixture {
public:
    Bytes dlfOf(const Dictionary& from, std::optional<std::string> version = "1.0") const
    {
        const auto dlf = ProbeGenerator({resources, clock, std::move(version)}).generateDlfFromState(from);
        return dlf ? *dlf : Bytes();
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
    const Bytes expected = PacketText("A100 FD1F 00*8 01 00 01 00 4F7276657820 00 " // "Orvex "
                                      "45584543555441424C455F4E414D45 00*25 "       // "EXECUTABLE_NAME"
                                      "446563203139203230313820 32333A3539 00 "     // "Dec 19 2018 23:59"
                                      "00F15365 2EFF 01 00*73") // 1700000000, -210 minutes, daylight saving
                               .bytes();
    EXPECT_EQ(dlf, expected);

    EXPECT_EQ(textAt(dlfOf({}, std::nullopt), 16, 7), std::string("(none)\0", 7));
    clock.zone = {-59, false};
    EXPECT_EQ(textAt(dlfOf({}), 85, 4), std::string(4, '\0')) << "truncated toward zero";
}

TEST_F(MRLLogGeneratorTest, AppendsTheHistoryWithoutTheFirstByteOfEachEntry)
{
    const auto entry = [](const Bytes& packets) {
        return Dictionary::make({{"DisplayState", std::make_shared<Bytes>(packets)}});
    };
    state.set(
        "History", Array::make({entry({1, 2, 3}), entry({9}), entry({}), Dictionary::make(), entry({1, 4})}));
    const Bytes dlf = dlfOf(state);
    EXPECT_EQ(Bytes(dlf.begin() + 161, dlf.end()), (Bytes{2, 3, 4}));
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
