#include "RawMessages.h"

#include "CaptureBytes.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace orvex {
namespace {

using namespace test;

Bytes message(Bytes front, std::size_t recordLength)
{
    return front += dlfRecord(recordLength, 1);
}

TEST(RawMessages, AreCutWhereTheirLengthsSay)
{
    const std::vector<Bytes> messages = {message({1}, 12), message({255}, 300), message({0x81, 0x81, 1}, 12),
        message({0x81, 1, 255}, 50), message({2}, 13)};
    Bytes all;
    std::vector<std::size_t> ends;
    for (const Bytes& each : messages) {
        all += each;
        ends.push_back(all.size());
    }
    for (std::size_t length = 0; length <= all.size(); ++length) {
        const Bytes cut(all.begin(), all.begin() + static_cast<std::ptrdiff_t>(length));
        RawMessages raw(cut);
        std::size_t count = 0;
        for (auto each = raw.next(); each; each = raw.next(), ++count)
            ASSERT_TRUE(std::ranges::equal(*each, messages.at(count))) << length;
        EXPECT_EQ(count, std::ranges::upper_bound(ends, length) - ends.begin()) << length;
        EXPECT_EQ(raw.rest(), length - (count == 0 ? 0 : ends[count - 1])) << length;
    }
}

TEST(RawMessages, EndWhereALengthIsShorterThanAHeader)
{
    for (Bytes wrong : {Bytes{1, 11, 0}, Bytes{0x81, 0, 1, 11, 0}}) {
        wrong.resize(30);
        Bytes all = message({1}, 20);
        all += wrong;
        RawMessages raw(all);
        EXPECT_TRUE(raw.next());
        EXPECT_FALSE(raw.next());
        EXPECT_EQ(raw.rest(), 30U);
    }
}

} // namespace
} // namespace orvex
