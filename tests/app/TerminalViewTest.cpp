#include "TerminalView.h"

#include "PaneFixture.h"
#include "SessionFixture.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

// Twelve lines: the root, A, its rows 0 to 9.
Value display(const char* prefix)
{
    const DictionaryRef rowsOfA = Dictionary::make();
    for (int row = 0; row < 10; ++row)
        rowsOfA->set(prefix + std::to_string(row), row % 2 == 0 ? "even" : "odd");
    return Dictionary::make({{"A", rowsOfA}});
}

struct TerminalViewTest : testing::Test {
    TerminalViewTest() { output.size = TerminalSize{.columns = 60, .rows = 6}; }

    void show(const Tree& tree)
    {
        view.show({.status = "S", .isConnected = true, .path = "/", .tree = tree.root});
    }
    // The body and the footer after the keys, without indents and erasures.
    std::string after(std::string_view input)
    {
        for (const TerminalKey& key : terminalKeysIn(input))
            EXPECT_TRUE(view.press(key));
        QString frame = QString::fromStdString(output.take());
        frame = frame.mid(frame.lastIndexOf("\x1b[H"));
        frame.remove(QRegularExpression("^.*\n|\x1b\\[[HKJ]|(?<=[\nm]) +"));
        return frame.replace('\n', '|').toStdString();
    }

    RecordingOutput output;
    TerminalView view{output, {.hasKeyboard = [] { return true; }}};
};

TEST_F(TerminalViewTest, ScrollsAndSearches)
{
    const std::string kHelp = "; arrow and Page keys scroll, / searche";
    const std::string kFound = "': n goes to the next line, N to the one before, Esc en\xe2\x80\xa6";
    show(Tree(display("r")));
    const std::pair<const char*, std::string> steps[] = {
        {"", "Orvex|A|r0: even|r1: odd|Lines 1 to 4 of 12" + kHelp},
        {"\x1b[A", "Orvex|A|r0: even|r1: odd|Lines 1 to 4 of 12" + kHelp},
        {"\x1b[Bj", "r0: even|r1: odd|r2: even|r3: odd|Lines 3 to 6 of 12" + kHelp},
        {"\x1b[6~", "r3: odd|r4: even|r5: odd|r6: even|Lines 6 to 9 of 12" + kHelp},
        {"\x1bOF", "r6: even|r7: odd|r8: even|r9: odd|Lines 9 to 12 of 12" + kHelp},
        {"\x1b[5~k", "r2: even|r3: odd|r4: even|r5: odd|Lines 5 to 8 of 12" + kHelp},
        // From the top line on, and only as far as needed.
        {"/R5", "r2: even|r3: odd|r4: even|\x1b[7mr5: odd\x1b[0m|/R5"},
        {"\x7f\x7f"
         "A",
            "Orvex|\x1b[7mA\x1b[0m|r0: even|r1: odd|/A"},
        {"\x7f"
         "dd",
            "r2: even|\x1b[7mr3: odd\x1b[0m|r4: even|r5: odd|/dd"},
        {"\rn", "r2: even|r3: odd|r4: even|\x1b[7mr5: odd\x1b[0m|'dd" + kFound},
        {"nn", "r8: even|\x1b[7mr9: odd\x1b[0m"},
        {"N", "r6: even|\x1b[7mr7: odd\x1b[0m|r8: even"},
        {"/zz\r", "No line has 'zz'."},
        {"\x1b", "Lines "},
    };
    for (const auto& [input, shown] : steps)
        EXPECT_THAT(after(input), testing::HasSubstr(shown))
            << QByteArray(input).toPercentEncoding().toStdString();
    EXPECT_FALSE(view.press({TerminalKey::Code::text, "q"}));
}

TEST_F(TerminalViewTest, KeepsItsPlaceAndFindsAgainWhenTheTreeChanges)
{
    show(Tree(display("r")));
    after("/r6\r");
    show(Tree(display("s")));
    EXPECT_THAT(after("\f"), testing::HasSubstr("No line has 'r6'."));
    show(Tree(rows({{"x", "r6"}})));
    EXPECT_THAT(after("\f"), testing::StartsWith("Orvex|\x1b[7mx: r6\x1b[0m|'r6"));
}

TEST(TerminalKeys, TakeEscapeSequencesWhole)
{
    using Code = TerminalKey::Code;
    const std::pair<const char*, std::vector<TerminalKey>> cases[] = {
        {"\x1b", {{Code::escape}}},
        {"\x1b[1;5C\x1b[B", {{Code::other}, {Code::down}}},
        {"\x1b[4~\x1b[H\x01", {{Code::end}, {Code::home}, {Code::other}}},
        {"\x1b[", {{Code::other}}}, // cut
        {"\xc3\xa9q\r", {{Code::text, "\xc3\xa9"}, {Code::text, "q"}, {Code::enter}}},
    };
    for (const auto& [input, keys] : cases)
        EXPECT_EQ(terminalKeysIn(input), keys) << QByteArray(input).toPercentEncoding().toStdString();
}

} // namespace
} // namespace orvex::test
