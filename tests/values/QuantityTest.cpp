#include "Quantity.h"

#include <gtest/gtest.h>

#include <string>

namespace orvex {
namespace {

TEST(Quantity, IsANumberWithAUnitThatRowsHave)
{
    const struct {
        const char* text;
        double number;
        const char* unit; // empty: no quantity
    } cases[] = {
        {"-75.50 dBm", -75.5, "dBm"},
        {"+3.00 dB", 3, "dB"},
        {"1.25%", 1.25, "%"},
        {"0 kbps", 0, "kbps"},
        {"10 sec", 10, "sec"},
        {"310", 0, ""},
        {"310-410", 0, ""},
        {"0x1A", 0, ""},
        {"89014103211118510720", 0, ""},
        {"12 dBmx", 0, ""},
        {"12  dBm", 0, ""},
        {"12 dBm ", 0, ""},
        {" 12 dBm", 0, ""},
        {"+-3 dB", 0, ""},
        {"- dB", 0, ""},
        {"dB", 0, ""},
        {"", 0, ""},
        {"-inf dB", 0, ""},
        {"nan dB", 0, ""},
        {"1e3 Hz", 0, ""},
        {"0.50% (old)", 0, ""},
        {"0 to 9", 0, ""},
        {"3 × 64chips", 0, ""},
    };
    for (const auto& [text, number, unit] : cases) {
        const auto quantity = quantityOf(text);
        EXPECT_EQ(quantity.has_value(), *unit != '\0') << text;
        EXPECT_EQ(quantity ? quantity->number : 0, number) << text;
        EXPECT_EQ(quantity ? quantity->unit : "", unit) << text;
    }
    EXPECT_FALSE(quantityOf(std::string(400, '9') + " Hz"));
}

} // namespace
} // namespace orvex
