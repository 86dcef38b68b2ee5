#include "PortFrame.h"

#include <gmock/gmock.h>

namespace orvex {
namespace {

const Bytes kThree = {
    3, 0, 0, 0, 0xFE, 0xFF, 0xFF, 0xFF, 1, 0, 0, 0, 4, 3, 2, 1, 'a', 'b', 'c', // request -2
    0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0,                            // one-way 0 without payload
    1, 0, 0, 0, 4, 3, 2, 1, 2, 0, 0, 0, 0, 0, 0, 0x80, 0xFF,                   // reply
};

std::string described(const Frame& frame)
{
    return std::to_string(frame.messageId) + '/' + std::to_string(static_cast<std::uint32_t>(frame.kind))
        + '/' + std::to_string(frame.correlation) + '/'
        + std::string(frame.payload.begin(), frame.payload.end()) + ' ';
}

std::string readIn(std::initializer_list<ByteView> parts)
{
    FrameReader reader;
    std::string frames;
    for (const ByteView part : parts) {
        reader.append(part);
        while (const auto frame = reader.take())
            frames += described(*frame);
    }
    EXPECT_EQ(reader.fault(), nullptr);
    EXPECT_FALSE(reader.isInsideFrame());
    return frames;
}

TEST(PortFrame, HeaderIsLittleEndian)
{
    const Bytes payload = {'a', 'b', 'c'};
    const auto frame = encodedFrame({-2, FrameKind::request, 0x01020304, payload});
    EXPECT_EQ(frame, Bytes(kThree.begin(), kThree.begin() + 19));
}

TEST(PortFrame, ReaderDoesNotCareWhereAStreamIsCut)
{
    const std::string whole = "-2/1/16909060/abc 0/0/0/ 16909060/2/2147483648/\xFF ";
    const ByteView all(kThree);
    EXPECT_EQ(readIn({all}), whole);
    for (std::size_t first = 0; first <= all.size(); ++first) {
        for (std::size_t second = first; second <= all.size(); ++second)
            EXPECT_EQ(
                readIn({all.first(first), all.subspan(first, second - first), all.subspan(second)}), whole)
                << first << ' ' << second;
    }
}

TEST(PortFrame, HeaderThatMakesNoSenseEndsTheStream)
{
    const struct {
        Bytes header;
        const char* fault;
    } cases[] = {
        {{0x01, 0x00, 0x00, 0x01, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "a payload of more than 16 MiB"},
        {{0xFF, 0xFF, 0xFF, 0xFF, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "a payload of more than 16 MiB"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 3, 0, 0, 0, 0, 0, 0, 0}, "a frame of unknown kind"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0}, "a frame of unknown kind"},
    };
    for (const auto& test : cases) {
        FrameReader reader;
        reader.append(kThree);
        reader.append(test.header);
        reader.append(kThree);
        int frames = 0;
        while (reader.take())
            ++frames;
        EXPECT_EQ(frames, 3);
        EXPECT_STREQ(reader.fault(), test.fault);
        EXPECT_FALSE(reader.take());
    }
    FrameReader reader;
    reader.append(Bytes{0x00, 0x00, 0x00, 0x01, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0});
    reader.append(Bytes(kLargestPayload));
    const auto largest = reader.take();
    ASSERT_TRUE(largest);
    EXPECT_EQ(largest->payload.size(), kLargestPayload);
}

} // namespace
} // namespace orvex
