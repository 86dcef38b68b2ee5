#include "Array.h"
#include "Dictionary.h"
#include "TextFormat.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace orvex {
namespace {

std::string keysOf(const Dictionary& dictionary)
{
    std::string keys;
    for (const auto& entry : dictionary)
        keys += entry.key + ' ';
    return keys;
}

TEST(Dictionary, KeysKeepThePlaceWhereTheyWereFirstSet)
{
    const auto dictionary = Dictionary::make({{"c", 1}, {"a", 2}, {"b", 3}, {"a", 4}});
    EXPECT_EQ(keysOf(*dictionary), "c a b ");
    EXPECT_EQ(*(*dictionary)["a"].integer(), 4);
    dictionary->set("c", 5);
    EXPECT_EQ(keysOf(*dictionary), "c a b ");
    dictionary->remove("c");
    dictionary->remove("not there");
    dictionary->set("c", 6);
    EXPECT_EQ(keysOf(*dictionary), "a b c ");
    EXPECT_TRUE((*dictionary)["not there"].isNull());
    EXPECT_EQ(dictionary->size(), 3U) << "looking a key up does not make it";
}

// Around the size at which an index takes over from the direct search.
TEST(Dictionary, LargeOnesFindRemoveAndCopyLikeSmallOnes)
{
    for (const int size : {23, 24, 25, 26, 1000}) {
        Dictionary dictionary;
        for (int i = 0; i < size; ++i)
            dictionary.set("key " + std::to_string(i), i);
        dictionary.remove("key 3");
        dictionary.set("key 3", -3);
        const auto copy = dictionary.shallowCopy();
        dictionary.remove("key 0");
        for (int i = 0; i < size; ++i) {
            const auto key = "key " + std::to_string(i);
            ASSERT_EQ(dictionary.contains(key), i != 0) << size;
            ASSERT_EQ(*(*copy)[key].integer(), i == 3 ? -3 : i) << size;
            ASSERT_TRUE(i == 0 || *dictionary[key].integer() == (i == 3 ? -3 : i)) << size;
        }
        EXPECT_TRUE(keysOf(dictionary).starts_with("key 1 key 2 key 4 "));
        EXPECT_TRUE(keysOf(dictionary).ends_with(" key 3 "));
    }
}

// Searching directly would take minutes.
TEST(Dictionary, HundredThousandKeysStayQuick)
{
    Dictionary dictionary;
    for (int round = 0; round < 3; ++round) {
        for (int i = 0; i < 100'000; ++i)
            dictionary.slot(std::to_string(i)) = round;
    }
    EXPECT_EQ(dictionary.size(), 100'000U);
    EXPECT_EQ(*dictionary["99999"].integer(), 2);
}

TEST(Value, ContainersAreSharedAndShallowCopiesShareWhatTheyHold)
{
    const auto inner = Dictionary::make({{"a", 1}});
    const auto outer = Array::make({inner, std::make_shared<Bytes>(Bytes{1})});
    const Value same = outer;
    const Value copy = Value(outer).shallowCopy();
    EXPECT_TRUE(same == copy);
    outer->append("more");
    inner->set("a", 2);
    EXPECT_EQ(same.array()->size(), 3U);
    EXPECT_EQ(copy.array()->size(), 2U);
    EXPECT_EQ(*(*(*copy.array())[0].dictionary())["a"].integer(), 2);

    const Value bytes = std::make_shared<Bytes>(Bytes{1});
    const Value bytesCopy = bytes.shallowCopy();
    bytes.data()->front() = 2;
    EXPECT_EQ(bytesCopy.data()->front(), 1);
}

TEST(Value, KindsAreToldApart)
{
    const Value values[] = {{}, "1", 1, 1.0, true, Date{1}, std::make_shared<Bytes>(Bytes{1}),
        Array::make({1}), Dictionary::make({{"1", 1}})};
    const char* names[] = {
        "null", "string", "integer", "real", "boolean", "date", "data", "array", "dictionary"};
    for (std::size_t i = 0; i < std::size(values); ++i) {
        EXPECT_STREQ(nameOf(values[i].kind()), names[i]);
        for (std::size_t j = 0; j < std::size(values); ++j)
            EXPECT_EQ(values[i] == values[j], i == j) << names[i] << ' ' << names[j];
    }
    EXPECT_TRUE(Value(ArrayRef()).isNull());
    EXPECT_TRUE(Value(std::uint8_t{200}) == Value(200)) << "every integer type makes an integer";
    EXPECT_TRUE(Dictionary({{"a", 1}, {"b", 2}}) == Dictionary({{"b", 2}, {"a", 1}}));
    EXPECT_FALSE(Dictionary({{"a", 1}}) == Dictionary({{"b", 1}}));
}

TEST(Array, GrowsFromItselfAndLosesItsFirst)
{
    const auto array = Array::make({1, 2, 3});
    array->appendAll(*array);
    EXPECT_TRUE(*array == Array({1, 2, 3, 1, 2, 3}));
    array->removeFirst(4);
    EXPECT_TRUE(*array == Array({2, 3}));
    array->removeFirst(9);
    EXPECT_TRUE(array->isEmpty());
}

TEST(DateText, IsInUTCAndWholeSeconds)
{
    const struct {
        double seconds;
        const char* text;
    } cases[] = {
        {0, "1970-01-01 00:00:00 +0000"},
        {1794808471.999, "2026-11-16 05:54:31 +0000"},
        {-1, "1969-12-31 23:59:59 +0000"},
        {-0.25, "1969-12-31 23:59:59 +0000"},
        {-2208988800, "1900-01-01 00:00:00 +0000"},
        {951782400, "2000-02-29 00:00:00 +0000"},
        {std::nan(""), "1970-01-01 00:00:00 +0000"},
        {-62135596800, "0001-01-01 00:00:00 +0000"},
    };
    for (const auto& test : cases)
        EXPECT_EQ(dateText({test.seconds}), test.text);
    EXPECT_FALSE(dateText({std::numeric_limits<double>::infinity()}).empty());
    EXPECT_FALSE(dateText({-1e300}).empty());
}

TEST(TextFormat, TextsOfAnyLengthComeOutWhole)
{
    for (const std::size_t length : {0U, 1U, 126U, 127U, 128U, 129U, 5000U}) {
        const std::string argument(length, 'x');
        EXPECT_EQ(text("%s", argument.c_str()), argument);
    }
    EXPECT_EQ(text("%4.2f %02X %lld", -0.5, 10U, -5LL), "-0.50 0A -5");
}

} // namespace
} // namespace orvex
