#include "Array.h"
#include "Dictionary.h"
#include "SipHash.h"
#include "VisibleText.h"

#include <gtest/gtest.h>

#include <cmath>

namespace orvex {
namespace {

// Around the size at which an index takes over from the direct search.
TEST(Dictionary, LargeOnesFindRemoveAndCopyLikeSmallOnes)
{
    for (const int size : {24, 25, 1000}) {
        Dictionary dictionary;
        for (int i = 0; i < size; ++i)
            dictionary.set("key " + std::to_string(i), i);
        dictionary.remove("key 3");
        dictionary.set("key 3", -3);
        const auto copy = dictionary.shallowCopy();
        dictionary.remove("key 0");
        for (int i = 0; i < size; ++i) {
            const auto key = "key " + std::to_string(i);
            ASSERT_EQ((*copy)[key], Value(i == 3 ? -3 : i)) << size;
            ASSERT_EQ(dictionary[key], i == 0 ? Value() : (*copy)[key]) << size;
        }
    }
}

// The reference's own vectors: the bytes 0, 1, 2, ... under the key 0, 1, ... 15.
TEST(SipHash, IsTheOneThatWasPublished)
{
    const std::string text("\0\1\2\3\4\5\6\7\10\11\12\13\14\15\16", 15);
    const std::pair<std::size_t, std::uint64_t> cases[] = {
        {0, 0x726FDB47DD0E0E31}, {1, 0x74F839C593DC67FD}, {8, 0x93F5F5799A932462}, {15, 0xA129CA6149BE45E5}};
    for (const auto& [length, hash] : cases)
        EXPECT_EQ(sipHash(text.substr(0, length), {0x0706050403020100, 0x0F0E0D0C0B0A0908}), hash) << length;
    EXPECT_NE(sipHash(text), sipHash(text, {0, 0})) << "without a key of its own";
}

TEST(VisibleText, ShowsWhatWouldCommandATerminal)
{
    const std::string kLong(4093, 'x');
    const std::pair<std::string, std::string> cases[] = {
        {"plain \xc3\xa9 \\n", "plain \xc3\xa9 \\n"},
        {"a\nb\tc\r", "a\\nb\\tc\\x0d"},
        {"\x1b[2J\x7f", "\\x1b[2J\\x7f"},
        {"\xc2\x85\xc2\x9b\xc2\xa0", "\\x85\\x9b\xc2\xa0"},                // C1, and the character after it
        {"\xe2\x80\xae\xe2\x81\xa6\xe2\x80\xa8", "\\u202e\\u2066\\u2028"}, // direction, end of line
        {"\xc2 \x9b\xe2\x80", "\\xc2 \\x9b\\xe2\\x80"},                    // no UTF-8
        {kLong + "\xe2\x82\xac", kLong + "\xe2\x82\xac"},
        {kLong + "x\xe2\x82\xac", kLong + "x\xe2\x80\xa6"},
    };
    for (const auto& [given, shown] : cases)
        EXPECT_EQ(visibleText(given), shown);
}

TEST(Value, ContainersAreSharedAndCopiesShareTheirBuffers)
{
    const auto inner = std::make_shared<Bytes>(Bytes{1});
    const auto outer = Array::make({inner});
    const Value same = outer;
    const Value copy = same.shallowCopy();
    const Value innerCopy = Value(inner).shallowCopy();
    const Value deepCopy = same.deepCopy();
    outer->append("more");
    inner->front() = 2;
    EXPECT_EQ(same.array()->size(), 2U);
    EXPECT_EQ(copy, Value(Array::make({inner})));
    EXPECT_EQ(innerCopy.data()->front(), 1);
    EXPECT_EQ(deepCopy, copy) << "which shares its buffers too";
}

TEST(Value, KindsAreToldApart)
{
    const Value values[] = {{}, "1", 1, 1.0, true, Date{1}, std::make_shared<Bytes>(Bytes{1}),
        Array::make({1}), Dictionary::make({{"1", 1}}), UID{1}, Set{Array::make({1})}};
    for (const Value& one : values) {
        for (const Value& other : values)
            EXPECT_EQ(one == other, &one == &other) << nameOf(one.kind()) << ' ' << nameOf(other.kind());
    }
    EXPECT_TRUE(Dictionary({{"a", 1}, {"b", 2}}) == Dictionary({{"b", 2}, {"a", 1}}));
    EXPECT_FALSE(Dictionary({{"a", 1}}) == Dictionary({{"b", 1}}));
    EXPECT_EQ(Value(Set{Array::make({1, 2})}), Value(Set{Array::make({2, 1})}));
}

TEST(Array, GrowsFromItselfAndLosesItsFirst)
{
    Array array{1, 2, 3};
    array.appendAll(array);
    array.removeFirst(2);
    EXPECT_TRUE(array == Array({3, 1, 2, 3}));
    array.removeFirst(9);
    EXPECT_TRUE(array.isEmpty());
}

TEST(DateText, IsInUTCAndWholeSeconds)
{
    EXPECT_EQ(dateText({1794808471.999}), "2026-11-16 05:54:31 +0000");
    EXPECT_EQ(dateText({-0.25}), "1969-12-31 23:59:59 +0000");
    EXPECT_EQ(dateText({std::nan("")}), "1970-01-01 00:00:00 +0000");
    EXPECT_EQ(dateText({-62135596800}), "0001-01-01 00:00:00 +0000");
    EXPECT_FALSE(dateText({-1e300}).empty());
}

} // namespace
} // namespace orvex
