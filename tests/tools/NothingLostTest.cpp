// A real session of the application, inside the test, with koratd as a program.

#include "KoratProgram.h"

#include "FileResources.h"
#include "KoratTelephonyService.h"
#include "OrvexModel.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"
#include "SystemClock.h"
#include "SystemLog.h"

#include <gtest/gtest.h>

#include <map>

namespace orvex::test {
namespace {

// Counts every line, which no log that may drop lines can.
class CountingLog final : public SystemLog {
public:
    CountingLog()
        : _previous(SystemLog::install(this))
    {
    }
    ~CountingLog() override { SystemLog::install(_previous); }
    CountingLog(const CountingLog&) = delete;
    CountingLog& operator=(const CountingLog&) = delete;

    void write(Priority, std::string_view line) override { ++_counts[std::string(line)]; }
    std::size_t count(const char* line) const
    {
        const auto found = _counts.find(line);
        return found == _counts.end() ? 0 : found->second;
    }

private:
    std::map<std::string, std::size_t> _counts;
    SystemLog* _previous;
};

class NothingLost : public testing::TestWithParam<std::pair<int, std::size_t>> { };

INSTANTIATE_TEST_SUITE_P(, NothingLost, testing::Values(std::pair(2000, 10'000U), std::pair(20'000, 40'000U)),
    [](const auto& each) { return std::to_string(each.param.first) + "PerSecond"; });

TEST_P(NothingLost, EveryMessageSentIsDecoded)
{
    const int rate = GetParam().first;
    const std::size_t count = GetParam().second;
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", QString::number(rate), "--count", QString::number(count)});

    CountingLog log;
    QtRunLoop runLoop;
    SocketMessagePorts ports(folder.ports());
    KoratTelephonyService telephony(ports);
    const FileResources resources(FileResources::defaultDirectory());
    const SystemClock clock;
    const auto model = OrvexModel::create({.runLoop = runLoop,
        .ports = ports,
        .telephony = telephony,
        .generators = {.resources = resources, .clock = clock, .buildVersion = std::nullopt}});
    model->restartMonitor();

    // Each message makes exactly one of the sections say one of these. Four of them are names of sections,
    // which say their names once more when they are bound to the display.
    const auto decoded = [&] {
        constexpr std::size_t kBound = 4;
        std::size_t sum = 0;
        for (const char* line : {"LTE Serving Cell Info", "Connected mode LTE Intra-frequency Measurement",
                 "Serving Cell Measurements", "Neighbor Measurements", "Reselection Candidates", "SimInfo",
                 "PDPContextList"})
            sum += log.count(line);
        return sum < kBound ? 0 : sum - kBound;
    };
    EXPECT_TRUE(waitUntil([&] { return decoded() >= count; }, std::chrono::seconds(60)));
    turnFor(std::chrono::milliseconds(200));
    EXPECT_EQ(decoded(), count);
    EXPECT_EQ(korat.terminateAndCount(), static_cast<long long>(count));
}

} // namespace
} // namespace orvex::test
