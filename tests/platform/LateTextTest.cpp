// Texts that are made when they are read: they are the same as if printf had made them at once.

#include "Array.h"
#include "Dictionary.h"

#include <gtest/gtest.h>

#include <limits>

namespace orvex {
namespace {

template <typename... Arguments>
std::string late(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    return LateText(format, arguments...).text();
}

TEST(LateTextTest, IsWhatPrintfMakes)
{
    EXPECT_EQ(late("plain 100%%"), "plain 100%");
    EXPECT_EQ(late("%d dBm", std::numeric_limits<int>::min()), "-2147483648 dBm");
    EXPECT_EQ(late("%d/%u", -1, std::numeric_limits<unsigned>::max()), "-1/4294967295");
    EXPECT_EQ(late("%d", std::uint8_t{255}), "255");
    EXPECT_EQ(late("%ld", std::numeric_limits<long>::min()), "-9223372036854775808");
    EXPECT_EQ(late("0x%06x", 0xABCU), "0x000abc");
    EXPECT_EQ(late("%4.2f %s", -140.0, "dBm"), "-140.00 dBm");
    EXPECT_EQ(late("%4.2lf", std::numeric_limits<double>::quiet_NaN()), " nan");
    EXPECT_EQ(late("%c", 0), std::string(1, '\0'));
    EXPECT_EQ(LateText("100%d").text(), "100%d"); // a text is no format
    const std::string longText = late("%f", 1e300);
    EXPECT_EQ(longText.size(), 308U);
}

TEST(LateTextTest, NobodyCanTellItInAValue)
{
    const Value value(LateText("%d", 7));
    const Value copy = value;
    EXPECT_EQ(value.kind(), Value::Kind::string);
    EXPECT_FALSE(value.isNull());
    EXPECT_EQ(value, Value("7"));
    EXPECT_NE(copy, Value("8"));
    EXPECT_EQ(Array({copy}), Array({"7"}));
    ASSERT_TRUE(copy.string());
    EXPECT_EQ(copy.string(), copy.string()) << "made once";
    EXPECT_EQ(copy.deepCopy(), value);
}

} // namespace
} // namespace orvex
