#include "PcapWriter.h"

#include "CaptureReader.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>

namespace orvex {
namespace {

using namespace std::chrono_literals;

TEST(PcapWriter, WritesTheFormatByteForByte)
{
    const test::TemporaryFile file;
    {
        PcapWriter writer(file.path);
        writer.write(Bytes{0x01, 0xFF, 0x81}, 1'700'000'000s + 654'321us);
        writer.write({}, 0s);
        EXPECT_EQ(writer.error(), "");
    }
    const Bytes expected = {0xD4, 0xC3, 0xB2, 0xA1, 2, 0, 4, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 4, 0, 147, 0, 0,
        0, // file header
        0x00, 0xF1, 0x53, 0x65, 0xF1, 0xFB, 0x09, 0x00, 3, 0, 0, 0, 3, 0, 0, 0, 0x01, 0xFF, 0x81, //
        0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0};
    std::ifstream stream(file.path, std::ios::binary);
    EXPECT_EQ(Bytes(std::istreambuf_iterator<char>(stream), {}), expected);
}

TEST(PcapWriter, MessageLongerThanReadersTakeSpoilsNothing)
{
    const test::TemporaryFile file;
    constexpr std::size_t kLongest = 262'144;
    {
        PcapWriter writer(file.path);
        for (const std::size_t length : {kLongest, kLongest + 1, std::size_t{5}})
            writer.write(Bytes(length, 7), 1s);
    }
    const auto reader = CaptureReader::open(file.path);
    for (const std::size_t length : {kLongest, std::size_t{5}}) {
        ASSERT_EQ(reader->next(), CaptureReader::Status::message) << reader->error();
        EXPECT_EQ(reader->message().size(), length);
    }
    EXPECT_EQ(reader->next(), CaptureReader::Status::end) << reader->error();
    EXPECT_THAT(reader->omissions(), testing::HasSubstr("1 packets"));
}

TEST(PcapWriter, SaysWhatCannotBeWritten)
{
    PcapWriter full("/dev/full");
    full.write(Bytes(10'000), 1s); // more than is kept back in memory
    EXPECT_EQ(full.error(), "/dev/full: No space left on device");
}

} // namespace
} // namespace orvex
