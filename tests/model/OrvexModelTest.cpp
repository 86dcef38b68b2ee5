#include "OrvexModel.h"

#include "FakeTelephony.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "ManualRunLoop.h"
#include "PacketText.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::EndsWith;
using testing::Not;
using testing::StartsWith;

const Bytes kAntennaPacket = packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 4, 8});

class OrvexModelTest : public testing::Test, public OrvexModelListener {
public:
    OrvexModelTest()
    {
        resources.templates["LTE"] =
            Dictionary::make({{"Serving Cell Info", Dictionary::make({{"Num Tx Antennas", "-"}})}});
        model = newModel();
    }

    std::shared_ptr<OrvexModel> newModel()
    {
        auto result = OrvexModel::create({runLoop, telephony, telephony, {resources, clock, "1.0"},
            [this](const std::string& why) { reported.push_back(why); }});
        result->setListener(this);
        return result;
    }
    void updateViewControllerFromModel() override { ++updates; }
    std::string shownAntennas() const
    {
        const auto node = model->nodeAtPath("/Serving Cell Info/Num Tx Antennas");
        return node ? *node->value() : "(none)";
    }

    RecordingLog log;
    ManualRunLoop runLoop;
    FakeTelephony telephony;
    FixedResources resources;
    FixedClock clock;
    std::shared_ptr<OrvexModel> model;
    int updates = 0;
    std::vector<std::string> reported;
};

TEST_F(OrvexModelTest, StartsTheStreamAndFollowsIt)
{
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
    model->startMonitor(); // does nothing more
    EXPECT_EQ(runLoop.timerCount(), 1U);
    ASSERT_EQ(telephony.sent.size(), 2U);
    EXPECT_EQ(telephony.sent[0], Value(Dictionary::make({{"GetTechnology", "GetTechnology"}})));
    EXPECT_EQ((*telephony.sent[1].dictionary())["SetState"], Value("Streaming"));
    EXPECT_THAT(telephony.portNames, testing::Each("org.orvex.BasebandStateReport.LogChannel"));
    EXPECT_THAT(telephony.messageIds, ElementsAre(0, 0));
    EXPECT_FALSE(telephony.wasConnectedAtRemotePort);
    EXPECT_THAT(telephony.timeouts, ElementsAre(1s, 1s, 1s)) << "query out, query back, command out";
    EXPECT_THAT(log.lines, Contains(StartsWith("<3> ***** Created ports (send=0x")));
    EXPECT_THAT(log.lines, Contains(StartsWith("<3>Got log generated: 0x")));
    EXPECT_EQ(log.lines.back(), "<3>Starting the display update timer");

    EXPECT_EQ(telephony.deliver(kAntennaPacket), std::nullopt) << "messages have no reply";
    EXPECT_EQ(updates, 0);
    runLoop.advance(2s);
    EXPECT_EQ(updates, 1);
    EXPECT_EQ(shownAntennas(), "4");
    EXPECT_EQ(model->nodeAtPath("/Serving Cell Info/no such row"), nullptr);
}

TEST_F(OrvexModelTest, RebuildsTheTreeOnlyAfterSomethingArrived)
{
    model->restartMonitor();
    telephony.deliver(kAntennaPacket);
    telephony.notifyConnection(); // a notice of the service refreshes at once
    runLoop.runPosted();
    EXPECT_EQ(updates, 1);
    const auto tree = model->topLevelNodes();
    EXPECT_EQ(model->topLevelNodes(), tree);
    telephony.deliver(kAntennaPacket, 1); // not a log message
    runLoop.advance(10s);
    EXPECT_EQ(model->topLevelNodes(), tree);
    EXPECT_EQ(updates, 1);

    telephony.deliver(kAntennaPacket);
    telephony.deliver(kAntennaPacket);
    EXPECT_EQ(model->topLevelNodes(), tree) << "stale until the next tick";
    runLoop.advance(2s);
    EXPECT_NE(model->topLevelNodes(), tree);
    EXPECT_EQ(updates, 2);
}

TEST_F(OrvexModelTest, FailureIsLoggedAndRetriedEveryFiveSeconds)
{
    using Status = RemotePort::Status;
    const char* noPorts = "<3>Could not create the ports necessary";
    const char* noGenerator = "<3>No log generator technology works";
    const struct {
        TelephonyFaults faults;
        const char* line;
        const char* consequence = nullptr;
    } cases[] = {
        {{.localPortFails = true}, "<3>Could not create local message port", noPorts},
        {{.localPortExists = true}, "<3>Local messsage port already exists", noPorts},
        {{.serviceIsAbsent = true}, "<3>Could not create KoratServerConnection", noPorts},
        {{.channelError = 16}, "<3>_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 16!",
            noPorts},
        {{.remotePortName = std::nullopt}, "<3>Could not create a log channel (Korat returned null port)!",
            noPorts},
        {{.remotePortName = ""}, "<3>Could not create a log channel (Korat returned null port)!", noPorts},
        {{.remotePortFails = true}, "<3>Could not create the remote port!", noPorts},
        {{.requestStatus = Status::sendTimeout},
            "<3> ***** Could not send the GetTechnology command (got error=-1)", noGenerator},
        {{.rawReply = ""}, "<3> ***** No response to GetTechnology; cannot configure", noGenerator},
        {{.rawReply = "no"}, "<3> ***** Could not parse reply to GetTechnology; cannot configure",
            noGenerator},
        {{.rawReply = "<plist version=\"1.0\"><dict/></plist>"},
            "<3> ***** Reply to GetTechnology had no answer; cannot configure", noGenerator},
        {{.rawReply = "<plist version=\"1.0\"><array/></plist>"},
            "<3> ***** Reply to GetTechnology had no answer; cannot configure", noGenerator},
        {{.technology = "MRL_LTE2"}, "<3>Got log generated: (nil)", noGenerator},
        {{.commandStatus = Status::invalid}, "<3> ***** Could not send the START command (got error=-3)"},
    };
    for (const auto& [faults, line, consequence] : cases) {
        SCOPED_TRACE(line);
        model = newModel();
        static_cast<TelephonyFaults&>(telephony) = faults;
        model->restartMonitor();
        for (int retry = 0; retry < 3; ++retry) {
            EXPECT_FALSE(model->isConnected());
            EXPECT_EQ(runLoop.timerCount(), 0U);
            EXPECT_EQ(runLoop.delayedCount(), 1U);
            EXPECT_THAT(log.lines, Contains(line));
            EXPECT_TRUE(!consequence || log.lines.back() == consequence);
            log.take();
            runLoop.advance(4999ms);
            EXPECT_THAT(log.lines, Not(Contains(line))) << "too early";
            runLoop.advance(1ms);
        }
        static_cast<TelephonyFaults&>(telephony) = {};
        runLoop.advance(5s);
        EXPECT_TRUE(model->isConnected());
        EXPECT_EQ(runLoop.timerCount(), 1U);
        EXPECT_EQ(runLoop.delayedCount(), 0U);
    }
}

TEST_F(OrvexModelTest, LostServiceIsNoticedAtTheNextTickAndReopenedAtOnce)
{
    model->restartMonitor();
    telephony.deliver(kAntennaPacket);
    runLoop.advance(2s);
    log.take();
    telephony.remotePort->valid = false;
    telephony.serviceIsAbsent = true;
    EXPECT_TRUE(model->isConnected());
    runLoop.advance(2s);
    EXPECT_FALSE(model->isConnected());
    EXPECT_THAT(
        log.lines.front(), testing::AllOf(StartsWith("<3> ***** INVALIDATED 0x"), EndsWith(" *****")));
    EXPECT_THAT(log.lines, Contains("<3>Could not create KoratServerConnection")) << "tried at once";
    EXPECT_EQ(runLoop.timerCount(), 0U);

    telephony.serviceIsAbsent = false;
    runLoop.advance(5s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(shownAntennas(), "4") << "the last values stay";
    Bytes other = kAntennaPacket;
    other[20] = 2;
    telephony.deliver(other);
    runLoop.advance(2s);
    EXPECT_EQ(shownAntennas(), "2") << "and go on moving";
}

TEST_F(OrvexModelTest, InvalidatedLocalPortRestartsButDeliberateShutdownDoesNot)
{
    model->restartMonitor();
    const auto port = telephony.localPort;
    port->invalidate();
    EXPECT_EQ(telephony.localPortsCreated, 2);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(runLoop.timerCount(), 1U);
    log.take();
    model.reset();
    EXPECT_FALSE(telephony.localPort->valid);
    EXPECT_FALSE(telephony.remotePort->valid);
    EXPECT_EQ(telephony.localPortsCreated, 2);
    EXPECT_EQ(runLoop.timerCount(), 0U);
    EXPECT_THAT(log.lines, Not(Contains(testing::HasSubstr("INVALIDATED"))));
}

TEST_F(OrvexModelTest, MissingTemplateIsReportedAtEachStartAndLoggedForEachMessage)
{
    const std::string line = "<3>Cannot load template for display";
    const auto laidOut = resources.templates.extract("LTE");
    model->restartMonitor();
    model->restartMonitor();
    EXPECT_THAT(reported, ElementsAre("LTE.plist: missing", "LTE.plist: missing"));
    log.take();
    telephony.deliver(kAntennaPacket);
    telephony.deliver(kAntennaPacket);
    EXPECT_THAT(log.take(), testing::IsSupersetOf({line, line}));
    EXPECT_EQ(reported.size(), 2U);

    resources.templates["LTE"] = laidOut.mapped();
    telephony.deliver(kAntennaPacket);
    EXPECT_THAT(log.take(), Not(Contains(line)));
    resources.templates.clear(); // the state keeps what it needs
    model->restartMonitor();
    EXPECT_EQ(reported.size(), 2U);
}

TEST_F(OrvexModelTest, WithoutAGeneratorAMessageIsDroppedButStillRefreshes)
{
    model->restartMonitor();
    telephony.technology = "none of ours"; // the restart loses the generator
    model->restartMonitor();
    model->updateWithData(kAntennaPacket);
    model->refresh();
    runLoop.runPosted();
    EXPECT_EQ(updates, 1);
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    EXPECT_EQ(model->getSaveContents(), nullptr);
}

} // namespace
} // namespace orvex::test
