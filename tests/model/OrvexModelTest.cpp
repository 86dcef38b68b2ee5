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
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

const Bytes kAntennaPacket = packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 4, 8});

class OrvexModelTest : public testing::Test, public OrvexModelListener {
public:
    OrvexModelTest()
    {
        resources.templates["LTE"] =
            Dictionary::make({{"Serving Cell Info", Dictionary::make({{"Num Tx Antennas", "-"}})}});
        model = OrvexModel::create({runLoop, telephony, telephony, {resources, clock, "1.0"}});
        model->setListener(this);
        log.take();
    }

    void updateViewControllerFromModel() override { ++updates; }

    RecordingLog log;
    ManualRunLoop runLoop;
    FakeTelephony telephony;
    FixedResources resources;
    FixedClock clock;
    std::shared_ptr<OrvexModel> model;
    int updates = 0;
};

TEST_F(OrvexModelTest, StartsTheStreamAndFollowsIt)
{
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
    EXPECT_THAT(
        telephony.requests, ElementsAre(Value(Dictionary::make({{"GetTechnology", "GetTechnology"}}))));
    ASSERT_EQ(telephony.commands.size(), 1U);
    EXPECT_EQ((*telephony.commands[0].dictionary())["SetState"], Value("Streaming"));
    EXPECT_THAT(telephony.portNames, testing::Each("org.orvex.BasebandStateReport.LogChannel"));
    EXPECT_THAT(telephony.messageIds, ElementsAre(0, 0));
    EXPECT_THAT(telephony.timeouts, ElementsAre(1s, 1s, 1s)) << "query out, query back, command out";
    EXPECT_THAT(log.lines, Contains(StartsWith("<3> ***** Created ports (send=0x")));
    EXPECT_THAT(log.lines, Contains(StartsWith("<3>Got log generated: 0x")));
    EXPECT_EQ(log.lines.back(), "<3>Starting the display update timer");

    EXPECT_EQ(telephony.deliver(kAntennaPacket), std::nullopt) << "messages have no reply";
    EXPECT_EQ(updates, 0);
    runLoop.advance(2s);
    EXPECT_EQ(updates, 1);
    ASSERT_NE(model->nodeAtPath("/Serving Cell Info/Num Tx Antennas"), nullptr);
    EXPECT_EQ(*model->nodeAtPath("/Serving Cell Info/Num Tx Antennas")->value(), "4");
    EXPECT_EQ(model->nodeAtPath("/Serving Cell Info/no such row"), nullptr);
}

TEST_F(OrvexModelTest, RebuildsTheTreeOnlyAfterSomethingArrived)
{
    model->restartMonitor();
    telephony.deliver(kAntennaPacket);
    runLoop.advance(2s);
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

TEST_F(OrvexModelTest, NoticeOfTheServiceRefreshesAtOnce)
{
    model->restartMonitor();
    telephony.deliver(kAntennaPacket);
    telephony.notifyConnection();
    runLoop.runPosted();
    EXPECT_EQ(updates, 1);
}

TEST_F(OrvexModelTest, RestartThatMeetsAnUnknownTechnologyLosesItsGenerator)
{
    model->restartMonitor();
    telephony.technology = "none of ours";
    model->restartMonitor();
    EXPECT_THAT(log.lines, Contains("<3>No log generator technology works"));
    EXPECT_EQ(model->topLevelNodes(), nullptr);
}

TEST_F(OrvexModelTest, StartingTwiceDoesNothing)
{
    model->startMonitor();
    model->startMonitor();
    EXPECT_EQ(telephony.localPortsCreated, 1);
    EXPECT_EQ(runLoop.timerCount(), 1U);
}

struct Failure {
    const char* name;
    void (*breakIt)(FakeTelephony&);
    std::vector<std::string> lines; // what the log says of it
};

class OrvexModelFailureTest : public OrvexModelTest, public testing::WithParamInterface<Failure> { };

TEST_P(OrvexModelFailureTest, IsLoggedAndTriedAgainEveryFiveSeconds)
{
    GetParam().breakIt(telephony);
    model->restartMonitor();
    for (const std::string& line : GetParam().lines)
        EXPECT_THAT(log.lines, Contains(line));
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(runLoop.timerCount(), 0U);

    for (int retry = 0; retry < 3; ++retry) {
        log.take();
        runLoop.advance(4999ms);
        EXPECT_THAT(log.lines, Not(Contains(GetParam().lines.front()))) << "too early";
        runLoop.advance(1ms);
        EXPECT_THAT(log.lines, Contains(GetParam().lines.front()));
        EXPECT_EQ(runLoop.delayedCount(), 1U);
    }

    telephony.localPortFails = telephony.localPortExists = telephony.serviceIsAbsent = false;
    telephony.channelError = 0;
    telephony.remotePortName = "org.orvex.Korat.Test";
    telephony.remotePortFails = false;
    telephony.requestStatus = telephony.commandStatus = RemotePort::Status::success;
    telephony.rawReply.reset();
    telephony.technology = "MRL_LTE";
    runLoop.advance(5s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(runLoop.timerCount(), 1U);
    EXPECT_EQ(runLoop.delayedCount(), 0U);
}

Bytes xml(const char* inner)
{
    const std::string list = std::string("<plist version=\"1.0\">") + inner + "</plist>";
    return {list.begin(), list.end()};
}

const std::string kNoPorts = "<3>Could not create the ports necessary";
const std::string kNoGenerator = "<3>No log generator technology works";

const std::vector<Failure> kFailures = {
    {"NoLocalPort", [](FakeTelephony& t) { t.localPortFails = true; },
        {"<3>Could not create local message port", kNoPorts}},
    {"LocalPortExists", [](FakeTelephony& t) { t.localPortExists = true; },
        {"<3>Local messsage port already exists", kNoPorts}},
    {"NoService", [](FakeTelephony& t) { t.serviceIsAbsent = true; },
        {"<3>Could not create KoratServerConnection", kNoPorts}},
    {"ChannelRefused", [](FakeTelephony& t) { t.channelError = 16; },
        {"<3>_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 16!", kNoPorts}},
    {"NullPort", [](FakeTelephony& t) { t.remotePortName.reset(); },
        {"<3>Could not create a log channel (Korat returned null port)!", kNoPorts}},
    {"EmptyPort", [](FakeTelephony& t) { t.remotePortName = ""; },
        {"<3>Could not create a log channel (Korat returned null port)!", kNoPorts}},
    {"NoRemotePort", [](FakeTelephony& t) { t.remotePortFails = true; },
        {"<3>Could not create the remote port!", kNoPorts}},
    {"QueryNotSent", [](FakeTelephony& t) { t.requestStatus = RemotePort::Status::sendTimeout; },
        {"<3> ***** Could not send the GetTechnology command (got error=-1)", kNoGenerator}},
    {"NoReply", [](FakeTelephony& t) { t.rawReply = Bytes(); },
        {"<3> ***** No response to GetTechnology; cannot configure", kNoGenerator}},
    {"BadReply",
        [](FakeTelephony& t) {
            t.rawReply = Bytes{'n', 'o'};
        },
        {"<3> ***** Could not parse reply to GetTechnology; cannot configure", kNoGenerator}},
    {"ReplyWithoutAnswer", [](FakeTelephony& t) { t.rawReply = xml("<dict/>"); },
        {"<3> ***** Reply to GetTechnology had no answer; cannot configure", kNoGenerator}},
    {"ReplyIsNoDictionary", [](FakeTelephony& t) { t.rawReply = xml("<array/>"); },
        {"<3> ***** Reply to GetTechnology had no answer; cannot configure", kNoGenerator}},
    {"UnknownTechnology", [](FakeTelephony& t) { t.technology = "MRL_LTE2"; },
        {"<3>Got log generated: (nil)", kNoGenerator}},
    {"TechnologyIsNoText", [](FakeTelephony& t) { t.technology = 5; },
        {"<3>Got log generated: (nil)", kNoGenerator}},
    {"CommandNotSent", [](FakeTelephony& t) { t.commandStatus = RemotePort::Status::invalid; },
        {"<3> ***** Could not send the START command (got error=-3)"}},
};

INSTANTIATE_TEST_SUITE_P(Session, OrvexModelFailureTest, testing::ValuesIn(kFailures),
    [](const auto& failure) { return failure.param.name; });

TEST_F(OrvexModelTest, ServiceThatDiesIsNoticedAtTheNextTickAndRestartedAtOnce)
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
    ASSERT_NE(model->nodeAtPath("/Serving Cell Info/Num Tx Antennas"), nullptr) << "the last values stay";
    Bytes other = kAntennaPacket;
    other[20] = 2;
    telephony.deliver(other);
    runLoop.advance(2s);
    EXPECT_EQ(*model->nodeAtPath("/Serving Cell Info/Num Tx Antennas")->value(), "2") << "and go on moving";
}

TEST_F(OrvexModelTest, InvalidatedLocalPortRestartsAtOnce)
{
    model->restartMonitor();
    const auto port = telephony.localPort;
    port->invalidate();
    EXPECT_EQ(telephony.localPortsCreated, 2);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(runLoop.timerCount(), 1U);
}

TEST_F(OrvexModelTest, DeliberateShutdownRestartsNothing)
{
    model->restartMonitor();
    model.reset();
    EXPECT_FALSE(telephony.localPort->valid);
    EXPECT_FALSE(telephony.remotePort->valid);
    EXPECT_EQ(telephony.localPortsCreated, 1);
    EXPECT_EQ(runLoop.timerCount(), 0U);
    EXPECT_THAT(log.lines, Not(Contains(HasSubstr("INVALIDATED"))));
}

TEST_F(OrvexModelTest, MessageWithoutAGeneratorIsDroppedButCountsAsNews)
{
    telephony.technology = "nothing known";
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
