#include "OrvexConsole.h"
#include "TerminalFrame.h"

#include "SessionFixture.h"

#include <gtest/gtest.h>

#include <clocale>

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

class RecordingOutput final : public ConsoleOutput {
public:
    void write(std::string_view text) override { written += text; }
    std::optional<TerminalSize> terminalSize() const override { return size; }
    std::string take() { return std::exchange(written, {}); }

    std::optional<TerminalSize> size;
    std::string written;
};

class OrvexConsoleTest : public testing::Test, public SessionFixture {
protected:
    RecordingOutput output;
    OrvexConsole console{platform(), output};
};

constexpr const char* kBlock = "\nUpdated 2023-11-14 at 22:13:20\n"
                               "Orvex\n"
                               "  Neighbor Measurements\n"
                               "    Version: 3\n"
                               "    E-ARFCN: 6300\n"
                               "    Qrxlevmin: -140 dBm\n"
                               "  Neighbor Cells List\n";

TEST_F(OrvexConsoleTest, WritesABlockAtEveryRefreshAndSaysOnceThatItConnects)
{
    telephony.serviceIsAbsent = true;
    console.start();
    runLoop.advance(std::chrono::seconds(4));
    EXPECT_EQ(output.take(), "Connecting...\n");
    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(1));
    deliverNeighbors(0);
    refresh();
    EXPECT_EQ(output.take(), kBlock);
    refresh(); // nothing has arrived
    EXPECT_EQ(output.take(), "");
    loseService();
    runLoop.advance(std::chrono::seconds(4));
    EXPECT_EQ(output.take(), "\nConnecting...\n");
    telephony.serviceIsAbsent = false;
    runLoop.advance(std::chrono::seconds(5));
    deliverNeighbors(0);
    refresh();
    EXPECT_EQ(output.take(), kBlock);
    console.applicationWillTerminate();
    console.applicationWillTerminate();
    EXPECT_EQ(preferences.done, kHomeScreenWrite);
    EXPECT_FALSE(telephony.localPort->valid);
}

TEST_F(OrvexConsoleTest, RedrawsATerminalInPlace)
{
    output.size = TerminalSize{.columns = 20, .rows = 6};
    console.start();
    EXPECT_EQ(output.take(), "\x1b[H\x1b[2JConnecting...\x1b[K\n\x1b[J");
    runLoop.runPosted();
    deliverNeighbors(0);
    refresh();
    EXPECT_EQ(output.take(),
        "\x1b[HUpdated 2023-11-14 \xe2\x80\xa6\x1b[K\n"
        "Orvex\x1b[K\n"
        "  Neighbor Measurem\xe2\x80\xa6\x1b[K\n"
        "    Version: 3\x1b[K\n"
        "... 3 more lines\x1b[K\n"
        "\x1b[J");
}

TEST(TerminalFrame, FillsColumnsDownwardsAndSaysWhatIsMissing)
{
    Lines body;
    for (int i = 1; i <= 7; ++i)
        body.push_back("line " + std::to_string(i));
    const std::string line1 = "line 1" + std::string(40, ' ') + "  ";
    const struct {
        const char* name;
        TerminalSize size;
        Lines frame;
    } cases[] = {
        {"high enough", {200, 9},
            {"S", "line 1", "line 2", "line 3", "line 4", "line 5", "line 6", "line 7"}},
        {"two columns", {94, 6},
            {"S", line1 + "line 5", "line 2" + line1.substr(6) + "line 6",
                "line 3" + line1.substr(6) + "line 7", "line 4"}},
        {"a column short", {93, 6}, {"S", "line 1", "line 2", "line 3", "... 4 more lines"}},
        {"hardly a terminal", {7, 1}, {"S", "... 7 \xe2\x80\xa6"}},
    };
    for (const auto& test : cases) {
        SCOPED_TRACE(test.name);
        EXPECT_EQ(terminalFrame("S", body, test.size), test.frame);
    }
}

TEST(TerminalFrame, CutsTextsByTheCellsTheyTake)
{
    const std::string former = std::setlocale(LC_CTYPE, nullptr);
    ASSERT_NE(std::setlocale(LC_CTYPE, "C.UTF-8"), nullptr);
    EXPECT_EQ(fittedToCells("abcdef", 6, false), "abcdef");
    EXPECT_EQ(fittedToCells("abcdef", 5, false), "abcd\xe2\x80\xa6");
    EXPECT_EQ(fittedToCells("caf\xc3\xa9", 6, true), "caf\xc3\xa9  ");
    EXPECT_EQ(
        fittedToCells("\xe4\xb8\xad\xe5\x9b\xbd", 4, true), "\xe4\xb8\xad\xe5\x9b\xbd"); // two cells each
    EXPECT_EQ(fittedToCells("\xe4\xb8\xad\xe5\x9b\xbd", 3, true), "\xe4\xb8\xad\xe2\x80\xa6");
    EXPECT_EQ(fittedToCells("ab", 0, true), "");
    std::setlocale(LC_CTYPE, former.c_str());
}

} // namespace
} // namespace orvex::test
