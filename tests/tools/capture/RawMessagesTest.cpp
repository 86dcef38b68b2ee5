#include "RawMessages.h"

#include "DlfBytes.h"

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

TEST(RawMessages, EndWhereALengthLeadsNowhere)
{
    const Bytes fronts[] = {
        {1, 0, 0},           // no length
        {1, 11, 0},          // shorter than a header
        {1, 30, 0},          // a byte beyond the end
        {0x81, 0, 1, 11, 0}, // the same two behind a prefix
        {0x81, 0, 1, 28, 0},
    };
    for (Bytes wrong : fronts) {
        SCOPED_TRACE(testing::PrintToString(wrong));
        wrong.resize(30);
        Bytes all = message({1}, 20);
        all += wrong;
        RawMessages raw(all);
        EXPECT_TRUE(raw.next());
        EXPECT_FALSE(raw.next());
        EXPECT_FALSE(raw.next());
        EXPECT_EQ(raw.rest(), 30U);
    }
}

} // namespace
} // namespace orvex
