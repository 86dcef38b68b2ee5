// From ModemManager's objects to what a monitor shows of them.

#include "modem/IfxReport.h"
#include "modem/ModemManagerCells.h"
#include "modem/ModemManagerState.h"

#include "CaseLines.h"
#include "ModemDisplay.h"

#include <gtest/gtest.h>

#include <fstream>

namespace orvex::korat {
namespace {

// The objects of an LTE modem as an AT modem of version 1.20 has them.
DictionaryRef objects()
{
    std::ifstream file(ORVEX_TESTS "/tools/modem/objects.json");
    return valueOf(Json::parse(file)).dictionary();
}

constexpr const char* kModemPath = "/org/freedesktop/ModemManager1/Modem/3";

// The state of a modem with these properties.
ModemState stateOf(const std::string& properties)
{
    const Value all = valueOf({{"/a", {{kModemInterface, Json::parse(properties)}, {kSignalInterface, 3}}}});
    return modemStateOf(*all.dictionary(), "/a", true);
}

std::string shownOf(const std::string& subject)
{
    const auto [kind, rest] = test::divided(subject, " ");
    if (kind[0] == '{')
        return conditionLine(stateOf(subject));
    if (kind == "modem")
        return test::shown(section(display("IFX", stateOf(rest)), "Modem"));
    ModemState state;
    if (kind == "location") {
        state.condition = Condition::enabled;
        state.location = locationIn(Dictionary::make({{"1", rest}, {"4", "$GPGGA"}}));
        return test::shown(section(display("IFX", state), "Location"));
    }
    state = modemStateOf(*objects(), kModemPath, false);
    state.cellAnswer = CellAnswer::notSupported;
    const auto [technology, name] = test::divided(rest.substr(2), " | ");
    const Value whole = display(technology.c_str(), state);
    return test::shown(name.empty() ? whole : section(whole, name.c_str()));
}

// Lines of states.txt: "SUBJECT -> SHOWN". The subject is a modem's properties, for what stands in the way,
// "modem" and properties, for IFX's section of it, "location" and a text, or "objects | TECHNOLOGY |
// SECTION".
TEST(ModemState, IsShown)
{
    for (const std::string& line : test::caseLines("tools/modem/states.txt")) {
        const std::string subject = test::divided(line, " ->").first;
        const std::string shown = shownOf(subject);
        EXPECT_EQ(subject + (shown.empty() ? " ->" : " -> " + shown), line);
    }
}

TEST(ModemState, HasIdentitiesOnlyIfTheyAreAskedFor)
{
    const std::string all = test::shown(display("IFX", modemStateOf(*objects(), kModemPath, true)));
    for (const char* identity : {"IMEI=490154203237518", "IMSI=001010123456789", "EID=89049032000001"})
        EXPECT_NE(all.find(identity), all.npos) << identity;
}

TEST(ModemState, OfSeveralModemsTheFirstThatIsEnabledIsWatched)
{
    const auto modems = [](std::initializer_list<std::pair<const char*, int>> states) {
        auto result = Dictionary::make();
        for (const auto& [path, state] : states) {
            const auto properties = Dictionary::make({{"State", state}});
            result->set(path, Dictionary::make({{kModemInterface, properties}}));
        }
        return watchedModemIn(*result);
    };
    EXPECT_EQ(modems({}), "");
    EXPECT_EQ(modems({{"/10", 8}, {"/9", 8}, {"/2", 3}}), "/9");
    EXPECT_EQ(modems({{"/1", -1}, {"/2", 3}}), "/2");
}

} // namespace
} // namespace orvex::korat
