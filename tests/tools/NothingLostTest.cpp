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

class NothingLost : public testing::TestWithParam<std::pair<int, std::size_t>> { };

INSTANTIATE_TEST_SUITE_P(, NothingLost, testing::Values(std::pair(2000, 10'000U), std::pair(20'000, 40'000U)),
    [](const auto& each) { return std::to_string(each.param.first) + "PerSecond"; });

TEST_P(NothingLost, EveryMessageSentIsDecodedAtItsPace)
{
    const auto& [rate, count] = GetParam();
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", QString::number(rate), "--count", QString::number(count)});

    RecordingLog log;
    std::size_t messages = 0;
    const auto countNow = [&] {
        for (const std::string& line : log.take())
            messages += kLines.count(line);
        return messages;
    };
    QtRunLoop runLoop;
    SocketMessagePorts ports(folder.ports());
    KoratTelephonyService telephony(ports);
    const FileResources resources(FileResources::defaultDirectory());
    const SystemClock clock;
    const auto model = OrvexModel::create({.runLoop = runLoop,
        .ports = ports,
        .telephony = telephony,
        .generators = {.resources = resources, .clock = clock, .buildVersion = std::nullopt}});
    QElapsedTimer elapsed;
    elapsed.start();
    model->restartMonitor();
    EXPECT_TRUE(waitUntil([&, wanted = count + kBound] { return countNow() >= wanted; }, 60s));
    EXPECT_GE(elapsed.elapsed(), static_cast<qint64>(count * 1000) / rate - 100);
    turnFor(200ms);
    EXPECT_EQ(countNow(), count + kBound);
    EXPECT_EQ(korat.terminateAndCount(), static_cast<long long>(count));
}

} // namespace
} // namespace orvex::test
