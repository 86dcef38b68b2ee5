#include "DisplayTreePrinter.h"

#include "Array.h"
#include "Dictionary.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

TEST(DisplayTreePrinter, IndentsTheTree)
{
    const Value display = Dictionary::make({
        {"Serving", Dictionary::make({{"Band", "3"}, {"Name", ""}})},
        {"Neighbors", Array::make({Dictionary::make({{"PCI", "12"}}), Dictionary::make()})},
        {"State", "Idle"},
    });
    NodesByPath paths;
    EXPECT_EQ(DisplayTreePrinter::text(*OrvexModelNode::makeTreeFromObject(display, paths)),
        "Orvex\n"
        "  Serving\n"
        "    Band: 3\n"
        "    Name:\n"
        "  Neighbors\n"
        "    0\n"
        "      PCI: 12\n"
        "    1\n"
        "  State: Idle\n");
    EXPECT_EQ(
        DisplayTreePrinter::text(*OrvexModelNode::makeTreeFromObject(Value(), paths)), "Orvex: (unknown)\n");
}

TEST(DisplayTreePrinter, WritesWhatWouldCommandATerminalVisibly)
{
    const Value display = Dictionary::make({{"a\nb", "\x1b[2J\t\x7f \xc2\x9b \xc3\xa9 \xc2"}});
    NodesByPath paths;
    EXPECT_EQ(DisplayTreePrinter::lines(*OrvexModelNode::makeTreeFromObject(display, paths))[1],
        "  a\\nb: \\x1b[2J\\t\\x7f \\x9b \xc3\xa9 \xc2");
}

} // namespace
} // namespace orvex::test
