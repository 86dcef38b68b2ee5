// From ModemManager's objects to what a monitor shows of them.

#include "modem/IfxReport.h"
#include "modem/ModemManagerCells.h"
#include "modem/ModemManagerState.h"

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

TEST(ModemState, IsShownWithoutIdentitiesUnlessTheyAreAskedFor)
{
    ModemState state = modemStateOf(*objects(), kModemPath, false);
    state.cellAnswer = CellAnswer::notSupported;
    state.location = locationIn(Dictionary::make({{"1", "001,01,0,1A2D001,84CD"}}));
    EXPECT_EQ(test::shown(display("IFX", state)),
        "{Modem={Manufacturer=Example, Model=M\\x1b[1m, Firmware=1.0.0, State=connected, "
        "Access Technology=LTE, 5G NR, Signal Quality=64 %}, "
        "Registration={State=roaming, Operator=Test Net, Network=001-01}, "
        "Cells=This modem does not tell its cells, "
        "Signal={LTE RSRP=-89.0 dBm, LTE RSRQ=-10.0 dB, LTE SNR=7.4 dB}, "
        "Location={Network=001-01, TAC=33997, Cell ID=27447297}, "
        "SIM={ICCID=89000101123456789001, Operator=Home Op, Home Network=001-01, Own Number=+15551234567}, "
        "Connections=[APN=internet.example, State=connected, Interface=wwan0, IPv4 Address=10.20.30.40/30, "
        "IPv4 Gateway=10.20.30.41, IPv6 Address=2001:db8::1/64, Name Servers=192.0.2.53, Duration=61 s, "
        "Received=5000000000 bytes, Sent=7 bytes]}");
    const Value lte = display("MRL_LTE", state);
    EXPECT_EQ(
        test::shown(section(lte, "SIM Info")), "{EF-ICCID=89000101123456789001, EF-MSISDN=+15551234567}");
    EXPECT_EQ(test::shown(section(lte, "PDP Context Info")),
        test::shown(section(display("IFX", state), "Connections")));

    const std::string all = test::shown(display("IFX", modemStateOf(*objects(), kModemPath, true)));
    for (const char* identity : {"IMEI=490154203237518", "IMSI=001010123456789", "EID=89049032000001"})
        EXPECT_NE(all.find(identity), all.npos) << identity;
}

TEST(ModemState, SaysWhatStandsInTheWay)
{
    const std::pair<const char*, const char*> cases[] = {
        {R"({"State": -1, "StateFailedReason": 2})", "The modem has failed: the SIM is missing"},
        {R"({"State": 2, "UnlockRequired": 2})", "The modem is locked and wants SIM PIN"},
        {R"({"State": 2, "UnlockRequired": 77})", "The modem is locked and wants a code"},
        {R"({"State": 3, "UnlockRequired": 1})", "The modem is not enabled"},
        {R"({"State": 8, "UnlockRequired": 1})", ""},
    };
    for (const auto& [properties, line] : cases) {
        const Value all = valueOf({{"/a", {{kModemInterface, Json::parse(properties)}}}});
        EXPECT_EQ(conditionLine(modemStateOf(*all.dictionary(), "/a", false)), line);
    }
    const auto wrong = valueOf(Json::parse(R"({"/a": {"org.freedesktop.ModemManager1.Modem": {"State": "11",
        "SignalQuality": [], "Sim": 7, "Bearers": "/Bearer/0", "OwnNumbers": [1], "AccessTechnologies": -1},
        "org.freedesktop.ModemManager1.Modem.Signal": 3}})"));
    const ModemState state = modemStateOf(*wrong.dictionary(), "/a", true);
    EXPECT_EQ(test::shown(section(display("IFX", state), "Modem")), "State: unknown");
    EXPECT_EQ(conditionLine(state), "The modem is not enabled");
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

TEST(ModemLocation, IsWhatTheNetworkTells)
{
    const std::pair<const char*, const char*> cases[] = {
        {"001,01,1234,D30156,0", "{Network=001-01, LAC=4660, Cell ID=13828438}"},
        {"310,410,FFFE,1A2D001,84CD", "{Network=310-410, LAC=65534, TAC=33997, Cell ID=27447297}"},
        {"001,01,0,0,0", "(null)"},
        {"001,01,1234,D30156", "(null)"},
        {"001,01,xyz,D30156,84CD", "{Network=001-01, TAC=33997, Cell ID=13828438}"},
        {"", "(null)"},
    };
    for (const auto& [text, shown] : cases) {
        ModemState state;
        state.condition = Condition::enabled;
        state.location = locationIn(Dictionary::make({{"1", text}, {"4", "$GPGGA"}}));
        EXPECT_EQ(test::shown(section(display("IFX", state), "Location")), shown) << text;
    }
}

} // namespace
} // namespace orvex::korat
