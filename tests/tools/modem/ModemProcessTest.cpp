// koratd as a program beside a modem that the test plays, on a bus of its own.

#include "modem/FakeModemManager.h"

#include "Environment.h"
#include "KoratClient.h"
#include "Programs.h"
#include "Shown.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

class ModemProcess : public testing::Test {
protected:
    ModemProcess() { setEnvironment("DBUS_SYSTEM_BUS_ADDRESS", bus.address().c_str()); }
    ~ModemProcess() override { setEnvironment("DBUS_SYSTEM_BUS_ADDRESS", nullptr); }

    // The last report of IFX.
    static std::string reportOf(const KoratClient& client)
    {
        const auto report =
            client.messages.empty() ? std::nullopt : propertyListFromData(client.messages.back()).value;
        return report ? shown(*report) : std::string();
    }
    static bool waitForReport(const KoratClient& client, const char* text)
    {
        const bool came = waitUntil([&] { return reportOf(client).find(text) != std::string::npos; });
        EXPECT_TRUE(came) << text << " is not in " << reportOf(client);
        return came;
    }
    long callsOf(const char* method) const { return std::ranges::count(modem.calls, method); }

    const PrivateBus bus;
    FakeModemManager modem{bus};
    const ProgramFolder folder;
};

TEST_F(ModemProcess, ShowsTheModemWhileAMonitorWatchesAndLeavesItAsItWas)
{
    KoratProgram korat(folder, {"--source", "modemmanager"});
    turnFor(500ms);
    EXPECT_TRUE(modem.calls.empty());
    {
        KoratClient client(folder.ports());
        ASSERT_EQ(client.open(), 0);
        EXPECT_EQ(client.technology(), Value("IFX"));
        client.send();
        for (const char* text :
            {"Serving Cell={Technology=LTE, TAC=33997, Cell ID=27447297}", "SIM=ICCID: 89000101123456789001",
                "Connections=[Connections | State=connected, Interface=wwan0]", "Signal=LTE RSRP: -94.0 dBm",
                "Location={Network=001-01, TAC=33997, Cell ID=27447297}"})
            waitForReport(client, text);
        EXPECT_EQ(reportOf(client).find("001010123456789"), std::string::npos);
        modem.cells[0]["ci"] = "2";
        waitForReport(client, "Cell ID=2}");
    }
    ASSERT_TRUE(korat.waitFor("has left"));
    const auto before = modem.calls;
    turnFor(6s); // longer than the period of questions
    EXPECT_EQ(modem.calls, before);
    EXPECT_EQ(callsOf("Setup 5"), 1);
    korat.terminateAndCount();
    EXPECT_EQ(callsOf("Setup 0"), 1);
}

TEST_F(ModemProcess, SaysWhatStandsInTheWayAndRecovers)
{
    modem.stopService();
    KoratProgram korat(folder, {"--source", "modemmanager"});
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    client.send();
    waitForReport(client, "Status=ModemManager is not running");
    modem.unplug();
    modem.startService();
    waitForReport(client, "Status=There is no modem");
    modem.modem[korat::kModemInterface]["State"] = 3;
    modem.plug();
    waitForReport(client, "Status=The modem is not enabled");
    EXPECT_EQ(callsOf("GetCellInfo"), 0);
    modem.cellError = "org.freedesktop.DBus.Error.AccessDenied";
    modem.change(korat::kModemInterface, "State", 8);
    waitForReport(client, "Cells=Not allowed to ask for cells; orvex-modem.conf allows it");
    waitForReport(client, "SIM=");
    EXPECT_TRUE(korat.waitFor("orvex-modem.conf"));
    modem.unplug();
    waitForReport(client, "Status=There is no modem");
    modem.cellError.clear();
    modem.plug();
    waitForReport(client, "Serving Cell=");
    modem.stopService();
    waitForReport(client, "Status=ModemManager is not running");
    modem.startService();
    waitForReport(client, "Serving Cell=");
    EXPECT_EQ(QString::fromStdString(korat.errors()).count("orvex-modem.conf"), 1) << korat.errors();
}

TEST_F(ModemProcess, AsksNoSecondTimeWhileTheModemHangs)
{
    modem.isHanging = true;
    KoratProgram korat(folder, {"--source", "modemmanager", "--technology", "auto"});
    ASSERT_TRUE(korat.waitFor("watching Example M1"));
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    client.send();
    ASSERT_TRUE(waitUntil([&] { return callsOf("GetCellInfo") == 1; }));
    turnFor(6s);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(client.technology(), Value("MRL_LTE")); // by the access technology
    EXPECT_LT(std::chrono::steady_clock::now() - start, 1s);
    EXPECT_EQ(callsOf("GetCellInfo"), 1);
    EXPECT_GT(callsOf("GetLocation"), 1);
}

TEST_F(ModemProcess, AsksTheMonitorToAskAgainWhenTheServingCellHasAnotherTechnology)
{
    KoratProgram korat(folder, {"--source", "modemmanager", "--technology", "auto"});
    ASSERT_TRUE(korat.waitFor("watching Example M1"));
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    EXPECT_EQ(client.technology(), Value("MRL_LTE"));
    client.send();
    ASSERT_TRUE(waitUntil([&] {
        std::set<Bytes> codes;
        for (const Bytes& message : client.messages)
            codes.insert({message.at(0), message.at(3), message.at(4)});
        return codes.size() == 3;
    }));
    modem.cells[0]["cell-type"] = 4U;
    ASSERT_TRUE(korat.waitFor("has to ask for the technology again"));
    ASSERT_EQ(client.open(), 0);
    EXPECT_EQ(client.technology(), Value("MRL_UTRAN2"));
}

} // namespace
} // namespace orvex::test
