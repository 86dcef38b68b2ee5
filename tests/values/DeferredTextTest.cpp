// Texts made by our own hand, now or when they are read: they are the same as if printf had made them.

#include "Array.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <limits>
#include <random>
#include <vector>

namespace orvex {
namespace {

template <typename... Arguments>
std::string late(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    return DeferredText(format, arguments...).text();
}

TEST(DeferredText, IsWhatPrintfMakes)
{
    EXPECT_EQ(late("%d/%u", std::numeric_limits<int>::min(), std::numeric_limits<unsigned>::max()),
        "-2147483648/4294967295");
    EXPECT_EQ(late("%ld", std::numeric_limits<long>::min()), "-9223372036854775808");
    EXPECT_EQ(late("0x%06x", 0xABCU), "0x000abc");
    EXPECT_EQ(late("%4.2f %s 100%%", -140.0, "dBm"), "-140.00 dBm 100%");
    EXPECT_EQ(late("%c", 0), std::string(1, '\0'));
    EXPECT_EQ(late("%-4u|%+d", 7, 8), "7   |+8");
    EXPECT_EQ(
        late("%5s%%%lu", "abc", std::numeric_limits<unsigned long>::max()), "  abc%18446744073709551615");
    EXPECT_EQ(DeferredText("100%d").text(), "100%d"); // a text is no format
    const Value value(DeferredText("%d", 7));
    EXPECT_EQ(value.kind(), Value::Kind::string);
    EXPECT_EQ(value.deepCopy(), Value("7"));
    EXPECT_EQ(value.string(), value.string()) << "made once";
    for (const std::size_t length : {0U, 127U, 128U, 5000U})
        EXPECT_EQ(text("%s", std::string(length, 'x').c_str()), std::string(length, 'x'));
}

#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral" // the formats stand in a table
TEST(TextFormat, RealsAreWhatPrintfMakes)
{
    const char* const formats[] = {"%f", "%.0f", "%4.2lf", "%-9.1f|", "%+.2f", "% .1f", "%+ f", "%08.2f",
        "%-08.2f", "%+012f", "%.02f", "%3.lf", "%.40f", "%400.1f", "%+14.3e", "%.0e", "%.17g", "%-12g"};
    std::vector<double> numbers{0.0, -0.0, 0.5, 1.5, 2.5, 0.125, -0.375, 0.005, -0.005, 1e-5, 999999.5, 9.995,
        1e15, -1.7976931348623157e308, 5e-324, 1.0 / 3, std::nan(""), -std::nan(""),
        std::numeric_limits<double>::infinity(), -std::numeric_limits<double>::infinity()};
    std::mt19937 random(1);
    std::uniform_int_distribution<int> counts(-(1 << 27), 1 << 27);
    for (int i = 0; i < 1000; ++i) // sixteenths are what most packets count in
        numbers.insert(numbers.end(), {counts(random) / 16.0, counts(random) * 0.001});
    for (const char* const format : formats) {
        for (const double number : numbers) {
            std::array<char, 1024> expected{};
            std::snprintf(expected.data(), expected.size(), format, number);
            std::string made;
            const PrintfValue value(number);
            appendPrinted(made, format, &value);
            ASSERT_EQ(made, expected.data()) << format << ' ' << number;
        }
    }
}
#pragma GCC diagnostic pop

} // namespace
} // namespace orvex
