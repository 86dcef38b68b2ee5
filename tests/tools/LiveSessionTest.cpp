// The whole road with real programs: koratd, and the monitor in a terminal.

#include "KoratClient.h"
#include "KoratProgram.h"

#include <gmock/gmock.h>

#include <QRegularExpression>

#include <set>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::HasSubstr;
using testing::Not;

// The monitor in a terminal.
class ConsoleProgram : public Program {
public:
    explicit ConsoleProgram(const ProgramFolder& folder)
        : Program(folder, ORVEX_PATH, {"--console"})
    {
    }
};

// What a row of a section has shown, each value once.
std::set<std::string> shown(const Program& monitor, const char* section, const char* row)
{
    const auto values = monitor.valuesOf(section, row);
    return {values.begin(), values.end()};
}

struct LiveCase {
    const char* technology;
    const char* section;
    const char* row;
};

void PrintTo(const LiveCase& each, std::ostream* stream)
{
    *stream << each.row;
}

class Live : public testing::TestWithParam<LiveCase> { };

INSTANTIATE_TEST_SUITE_P(LiveSession, Live,
    testing::Values(LiveCase{"MRL_LTE", "Serving Cell Measurements", "Measured RSRP"},
        LiveCase{"MRL_UTRAN2", "Neighbor Cell List", "Filter RSCP"}),
    [](const auto& each) { return std::string(each.param.technology); });

TEST_P(Live, ValuesChange)
{
    const auto& [technology, section, row] = GetParam();
    const ProgramFolder folder;
    const KoratProgram korat(folder, {"--technology", technology});
    ConsoleProgram monitor(folder);
    EXPECT_TRUE(waitUntil([&, s = section, r = row] { return shown(monitor, s, r).size() >= 3; }, 20s));
    EXPECT_THAT(monitor.output(), HasSubstr("Updated 2"));
    EXPECT_THAT(monitor.valuesOf("SIM Info", "EF-MSISDN"), Contains("+0010155550142"));
    EXPECT_THAT(monitor.valuesOf("PDP Context Info", "APN"), Contains("internet.example"));
    EXPECT_THAT(monitor.output(), Not(HasSubstr("(unknown)")));
    EXPECT_EQ(monitor.terminate(), 0);
}

TEST(LiveSession, AbsentServiceIsTriedAgainAfterFiveSeconds)
{
    const ProgramFolder folder;
    ConsoleProgram monitor(folder);
    ASSERT_TRUE(monitor.waitForError("Could not create KoratServerConnection"));
    QElapsedTimer elapsed;
    elapsed.start();
    EXPECT_TRUE(monitor.waitForError("Could not create the ports necessary"));
    EXPECT_TRUE(monitor.waitForOutput("Connecting..."));
    ASSERT_TRUE(monitor.waitForError("Could not create KoratServerConnection", 2));
    EXPECT_GE(elapsed.elapsed(), 4500);
    EXPECT_LE(elapsed.elapsed(), 8000);

    const KoratProgram korat(folder);
    EXPECT_TRUE(monitor.waitForOutput("Updated 2"));
}

TEST(LiveSession, ComesBackAfterTheServiceWasKilled)
{
    const ProgramFolder folder;
    auto korat = std::make_unique<KoratProgram>(folder);
    ConsoleProgram monitor(folder);
    ASSERT_TRUE(monitor.waitForOutput("Updated 2"));
    EXPECT_THAT(monitor.errors(), Not(HasSubstr("INVALIDATED")));

    korat->kill();
    QElapsedTimer elapsed;
    elapsed.start();
    ASSERT_TRUE(monitor.waitForError(" ***** INVALIDATED "));
    EXPECT_LE(elapsed.restart(), 4500); // the next tick
    ASSERT_TRUE(monitor.waitForError("Could not create KoratServerConnection"));
    EXPECT_LE(elapsed.elapsed(), 3000); // at once, not after the five seconds of a failed start
    EXPECT_TRUE(monitor.waitForOutput("Connecting...", 2));

    const auto before = shown(monitor, "Serving Cell Measurements", "Measured RSRP").size();
    korat = std::make_unique<KoratProgram>(folder, QStringList{"--seed", "99"});
    EXPECT_TRUE(waitUntil(
        [&] { return shown(monitor, "Serving Cell Measurements", "Measured RSRP").size() >= before + 2; },
        20s));
    EXPECT_THAT(monitor.errors(), Not(HasSubstr("already exists")));
}

struct FaultCase {
    const char* fault;
    const char* line;
};

void PrintTo(const FaultCase& each, std::ostream* stream)
{
    *stream << each.fault;
}

class Fault : public testing::TestWithParam<FaultCase> { };

INSTANTIATE_TEST_SUITE_P(LiveSession, Fault,
    testing::Values(FaultCase{"refuse-channel=35",
                        "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 35!"},
        FaultCase{"null-port", "Could not create a log channel (Korat returned null port)!"},
        FaultCase{"no-reply", " ***** No response to GetTechnology; cannot configure"},
        FaultCase{"bad-reply", " ***** Could not parse reply to GetTechnology; cannot configure"},
        FaultCase{"unknown-technology", "No log generator technology works"}),
    [](const auto& each) {
        QString name = each.param.fault;
        return name.replace(QRegularExpression("[^a-z]"), "").toStdString();
    });

TEST_P(Fault, IsLoggedAndLeavesTheMonitorConnecting)
{
    const auto& [fault, line] = GetParam();
    const ProgramFolder folder;
    const KoratProgram korat(folder, {"--fault", fault});
    ConsoleProgram monitor(folder);
    EXPECT_TRUE(monitor.waitForError(line));
    EXPECT_THAT(monitor.output(), Not(HasSubstr("Updated")));
    EXPECT_EQ(monitor.terminate(), 0) << monitor.errors();
}

TEST(LiveSession, GarbageIsSurvived)
{
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--fault", "garbage=50", "--rate", "3000"});
    ConsoleProgram monitor(folder);
    EXPECT_TRUE(monitor.waitForOutput("Updated 2", 3)) << monitor.errors();
    EXPECT_THAT(monitor.errors(), HasSubstr("Invalid log type"));
    EXPECT_EQ(monitor.terminate(), 0);
    EXPECT_GT(korat.terminateAndCount(), 5000);
}

TEST(LiveSession, SeveralMonitorsOneAfterAnother)
{
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", "100"});
    for (int run = 1; run <= 3; ++run) {
        ConsoleProgram monitor(folder);
        EXPECT_TRUE(monitor.waitForOutput("Updated 2")) << "run " << run << ": " << monitor.errors();
        EXPECT_EQ(KoratClient(folder.ports()).open(), EBUSY);
        if (run == 2)
            monitor.kill();
        else
            EXPECT_EQ(monitor.terminate(), 0);
        EXPECT_TRUE(korat.waitForError("has left; sent ", run));
    }
}

} // namespace
} // namespace orvex::test
