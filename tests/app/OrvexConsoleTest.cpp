#include "OrvexConsole.h"
#include "TerminalView.h"

#include "DisplayTreePrinter.h"
#include "NodesByPath.h"

#include "SessionFixture.h"

#include <gtest/gtest.h>

#include <clocale>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

struct OrvexConsoleTest : testing::Test, SessionFixture { };

TEST_F(OrvexConsoleTest, RedrawsATerminalInPlace)
{
    RecordingOutput output;
    output.size = TerminalSize{.columns = 20, .rows = 6};
    TerminalView screen(output, {});
    OrvexConsole redrawn(platform(), screen);
    redrawn.start();
    EXPECT_EQ(output.take(), "\x1b[H\x1b[2JConnecting...\x1b[K\n\x1b[J");
    runLoop.runPosted();
    deliverNeighbors(0);
    refresh();
    EXPECT_EQ(output.take(),
        "\x1b[HUpdated 2023-11-15 \xe2\x80\xa6\x1b[K\n"
        "Orvex\x1b[K\n"
        "  Neighbor Measurem\xe2\x80\xa6\x1b[K\n"
        "    Version: 3\x1b[K\n"
        "... 3 more lines\x1b[K\n"
        "\x1b[J");
}

TEST(DisplayTreePrinter, EscapesControlCharacters)
{
    const Value display = Dictionary::make({{"a\nb", "\x1b[2J"}, {"c", ""}});
    NodesByPath paths;
    EXPECT_EQ(DisplayTreePrinter::text(*OrvexModelNode::makeTreeFromObject(display, paths)),
        "Orvex\n  a\\nb: \\x1b[2J\n  c:\n");
}

TEST(TerminalFrame, FillsColumnsDownAndSaysWhatIsMissing)
{
    const Lines body = {"1", "2", "3", "4", "5", "6", "7"};
    const std::string gap(47, ' ');
    const std::tuple<TerminalSize, Lines> cases[] = {
        {{94, 6}, {"S", "1" + gap + "5", "2" + gap + "6", "3" + gap + "7", "4"}},
        {{93, 6}, {"S", "1", "2", "3", "... 4 more lines"}},
        {{7, 1}, {"S", "... 7 \xe2\x80\xa6"}},
    };
    for (const auto& [size, frame] : cases)
        EXPECT_EQ(terminalFrame("S", body, size), frame) << size.columns << " columns";
}

TEST(TerminalFrame, CutsTextsByTheirWidthInCells)
{
    ASSERT_NE(std::setlocale(LC_CTYPE, "C.UTF-8"), nullptr);
    EXPECT_EQ(fittedToCells("abcdef", 6, false), "abcdef");
    EXPECT_EQ(fittedToCells("caf\xc3\xa9", 6, true), "caf\xc3\xa9  ");
    // Two cells each.
    EXPECT_EQ(fittedToCells("\xe4\xb8\xad\xe5\x9b\xbd", 4, true), "\xe4\xb8\xad\xe5\x9b\xbd");
    EXPECT_EQ(fittedToCells("\xe4\xb8\xad\xe5\x9b\xbd", 3, true), "\xe4\xb8\xad\xe2\x80\xa6");
}

} // namespace
} // namespace orvex::test
