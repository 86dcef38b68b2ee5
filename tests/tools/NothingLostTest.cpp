// A real session of the application, inside the test, with koratd as a program.

#include "KoratProgram.h"
#include "RecordingLog.h"

#include "FileResources.h"
#include "KoratTelephonyService.h"
#include "OrvexModel.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"
#include "SystemClock.h"

#include <gtest/gtest.h>

#include <set>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

// Each message makes exactly one of the sections say one of these. Four of them are names of sections, which
// say their names once more when they are bound to the display. No log that may drop lines can count them.
constexpr std::size_t kBound = 4;
const std::set<std::string> kLines = {"<4>LTE Serving Cell Info",
    "<4>Connected mode LTE Intra-frequency Measurement", "<4>Serving Cell Measurements",
    "<4>Neighbor Measurements", "<4>Reselection Candidates", "<4>SimInfo", "<4>PDPContextList"};

class MessageCount {
public:
    std::size_t now()
    {
        for (const std::string& line : _log.take())
            _messages += kLines.count(line);
        return _messages;
    }

private:
    RecordingLog _log;
    std::size_t _messages = 0;
};

// A session of the application inside the test.
class Session {
public:
    explicit Session(const ProgramFolder& folder)
        : _ports(folder.ports())
    {
    }
    void start() { _model->restartMonitor(); }

private:
    QtRunLoop _runLoop;
    SocketMessagePorts _ports;
    KoratTelephonyService _telephony{_ports};
    const FileResources _resources{FileResources::defaultDirectory()};
    const SystemClock _clock;
    const std::shared_ptr<OrvexModel> _model = OrvexModel::create({.runLoop = _runLoop,
        .ports = _ports,
        .telephony = _telephony,
        .generators = {.resources = _resources, .clock = _clock, .buildVersion = std::nullopt}});
};

class NothingLost : public testing::TestWithParam<std::pair<int, std::size_t>> { };

INSTANTIATE_TEST_SUITE_P(, NothingLost, testing::Values(std::pair(2000, 10'000U), std::pair(20'000, 40'000U)),
    [](const auto& each) { return std::to_string(each.param.first) + "PerSecond"; });

TEST_P(NothingLost, EveryMessageSentIsDecodedAtItsPace)
{
    const auto& [rate, count] = GetParam();
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", QString::number(rate), "--count", QString::number(count)});

    MessageCount log;
    Session session(folder);
    QElapsedTimer elapsed;
    elapsed.start();
    session.start();
    EXPECT_TRUE(waitUntil([&, wanted = count + kBound] { return log.now() >= wanted; }, 60s));
    EXPECT_GE(elapsed.elapsed(), static_cast<qint64>(count * 1000) / rate - 100);
    turnFor(200ms);
    EXPECT_EQ(log.now(), count + kBound);
    EXPECT_EQ(korat.terminateAndCount(), static_cast<long long>(count));
}

TEST(NothingLostAtTheEnd, AServiceThatHasGoneIsHeardToItsLastMessage)
{
    constexpr std::size_t kCount = 150;
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", "100", "--count", QString::number(kCount)});
    MessageCount log;
    Session session(folder);
    session.start();
    EXPECT_TRUE(waitUntil([&] { return log.now() > 0; }));

    // The event loop stands still until a refresh is due, which finds the service gone.
    std::this_thread::sleep_for(1800ms);
    korat.kill();
    std::this_thread::sleep_for(500ms);
    EXPECT_TRUE(waitUntil([&] { return log.now() >= kCount + kBound; })) << log.now();
    turnFor(200ms);
    EXPECT_EQ(log.now(), kCount + kBound);
}

} // namespace
} // namespace orvex::test
