#include "Quantity.h"

#include "CaseLines.h"
#include "TextFormat.h"

#include <gtest/gtest.h>

namespace orvex {
namespace {

TEST(Quantity, IsANumberWithAUnitThatRowsHave)
{
    for (const std::string& line : test::caseLines("values/quantities.txt")) {
        const auto [quoted, expected] = test::divided(line, " = ");
        const std::string given = quoted.substr(1, quoted.size() - 2);
        const auto quantity = quantityOf(given);
        const std::string unit(quantity ? quantity->unit : "");
        EXPECT_EQ(quantity ? text("%g %s", quantity->number, unit.c_str()) : "", expected) << line;
    }
    EXPECT_FALSE(quantityOf(std::string(400, '9') + " Hz"));
}

} // namespace
} // namespace orvex
