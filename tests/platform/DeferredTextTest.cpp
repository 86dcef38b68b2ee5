// Texts made by our own hand, now or when they are read: they are the same as if printf had made them.

#include "Array.h"
#include "Dictionary.h"
#include "FixedPoint.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

namespace orvex {
namespace {

template <typename... Arguments>
std::string late(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    return DeferredText(format, arguments...).text();
}

TEST(DeferredTextTest, IsWhatPrintfMakes)
{
    EXPECT_EQ(late("plain 100%%"), "plain 100%");
    EXPECT_EQ(late("%d dBm", std::numeric_limits<int>::min()), "-2147483648 dBm");
    EXPECT_EQ(late("%d/%u", -1, std::numeric_limits<unsigned>::max()), "-1/4294967295");
    EXPECT_EQ(late("%ld", std::numeric_limits<long>::min()), "-9223372036854775808");
    EXPECT_EQ(late("0x%06x", 0xABCU), "0x000abc");
    EXPECT_EQ(late("%4.2f %s", -140.0, "dBm"), "-140.00 dBm");
    EXPECT_EQ(late("%4.2lf", std::numeric_limits<double>::quiet_NaN()), " nan");
    EXPECT_EQ(late("%c", 0), std::string(1, '\0'));
    EXPECT_EQ(late("%-4u|%+d", 7, 8), "7   |+8");
    EXPECT_EQ(
        late("%5s%%%lu", "abc", std::numeric_limits<unsigned long>::max()), "  abc%18446744073709551615");
    EXPECT_EQ(DeferredText("100%d").text(), "100%d"); // a text is no format
    EXPECT_EQ(late("%f", 1e300).size(), 308U);
}

// Sixteenths are what most packets count in; the others are harder to round.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral" // they stand in a table
TEST(FixedPointTest, IsWhatPrintfMakesOrNothing)
{
    std::mt19937 random(1);
    std::uniform_int_distribution<int> counts(-(1 << 27), 1 << 27);
    const char* const formats[] = {"%f", "%lf", "%.0f", "%.1f", "%4.2f", "%9.2f", "%.3lf", "%4.2lf", "%.6f"};
    const double units[] = {1.0 / 65536, 1.0 / 16, 0.125, 0.5, 1, 1.0 / 131072, 0.1};
    int made = 0;
    for (int i = 0; i < 20'000; ++i) {
        const int count = i < 4096 ? i - 2048 : counts(random);
        for (const double unit : units) {
            const char* const format = formats[static_cast<std::size_t>(i) % std::size(formats)];
            std::array<char, 400> expected{};
            std::snprintf(expected.data(), expected.size(), format, count * unit);
            std::string text = ">";
            const bool isMade = appendFixedPoint(text, format, count * unit);
            ASSERT_EQ(text, isMade ? std::string(">") + expected.data() : ">")
                << format << ' ' << count * unit;
            made += isMade ? 1 : 0;
        }
    }
    EXPECT_GT(made, 70'000) << "of 140,000, mostly by the printf of the C library";
    std::string text;
    EXPECT_TRUE(appendFixedPoint(text, "%4.2f", -0.0));
    EXPECT_EQ(text, "-0.00");
    for (const double number : {std::nan(""), std::numeric_limits<double>::infinity(), 67108864.0, 1e-9})
        EXPECT_FALSE(appendFixedPoint(text, "%.2f", number)) << number;
    for (const char* format : {"%e", "%.7f", "%-4.2f", "%+.2f", "%04.2f", "%12.2f"})
        EXPECT_FALSE(appendFixedPoint(text, format, 1)) << format;
}
#pragma GCC diagnostic pop

TEST(DeferredTextTest, NobodyCanTellItInAValue)
{
    const Value value(DeferredText("%d", 7));
    const Value copy = value;
    EXPECT_EQ(value.kind(), Value::Kind::string);
    EXPECT_EQ(value, Value("7"));
    EXPECT_NE(copy, Value("8"));
    EXPECT_EQ(copy.string(), copy.string()) << "made once";
    EXPECT_EQ(copy.deepCopy(), value);
}

} // namespace
} // namespace orvex
