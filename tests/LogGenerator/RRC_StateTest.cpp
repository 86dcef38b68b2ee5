#include "RRC_State.h"

#include "Console.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

TEST(RRC_State, NamesValidStates)
{
    std::vector<std::string> console;
    installConsole([&console](std::string_view line) { console.emplace_back(line); });
    const struct {
        Bytes payload;
        const char* state;
        int number;
    } cases[] = {
        {{1, 0}, "Disconnected", 0},
        {{1, 1}, "Connecting", 1},
        {{1, 2}, "Cell Fach", 2},
        {{1, 3}, "Cell DCH", 3},
        {{1, 4}, "Cell PCH", 4},
        {{1, 5}, "Cell URA PCH", 5},
        {{1, 6}, "Unknown RRC Mode", 6},
        {{1, 255}, "Unknown RRC Mode", 255},
        {{0, 3}, "Unknown RRC Mode", 255},
        {{2, 3}, "Unknown RRC Mode", 255},
    };
    SectionFixture<RRC_State> fixture;
    for (const auto& [payload, state, number] : cases) {
        console.clear();
        EXPECT_EQ(fixture.rowsAfter(packet(0xD0E0, payload), 0xD0E0), (RowTexts{{"State", state}}));
        EXPECT_EQ(console,
            std::vector{text("Display Dict = {State = %s; }, rrc mode = %d %s", state, number, state)});
        EXPECT_EQ(fixture.log.take(), std::vector<std::string>{"<4>RRC Info"});
    }
    installConsole({});
}

TEST(RRC_State, ReportsAShortPacketAndDecodesItAllTheSame)
{
    installConsole([](std::string_view) {});
    SectionFixture<RRC_State> fixture;
    EXPECT_EQ(fixture.rowsAfter(packet(0xD0E0, {1}), 0xD0E0), (RowTexts{{"State", "Unknown RRC Mode"}}));
    EXPECT_EQ(fixture.log.take(),
        (std::vector<std::string>{"<4>RRC Info", "<4>LogCode_0xD0E0 is length is 14 expected size 15"}));
    EXPECT_EQ(fixture.rowsAfter(Bytes(11), 0xD0E0), (RowTexts{{"State", "Unknown RRC Mode"}}));
    installConsole({});
}

} // namespace
} // namespace orvex::test
