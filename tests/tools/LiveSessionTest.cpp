// The whole road with real programs: koratd, and the monitor in a terminal.

#include "KoratClient.h"
#include "KoratProgram.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
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

TEST(LiveSession, ShowsChangingValues)
{
    const struct {
        const char* technology;
        const char* row;
    } cases[] = {{"MRL_LTE", "Measured RSRP"}, {"MRL_UTRAN2", "Filter RSCP"}};
    for (const auto& [technology, row] : cases) {
        const ProgramFolder folder;
        const KoratProgram korat(folder, {"--technology", technology});
        ConsoleProgram monitor(folder);
        EXPECT_TRUE(waitUntil([&, row = row] { return monitor.valuesOf(row).size() >= 3; }, 20s))
            << technology;
        EXPECT_THAT(monitor.output(), HasSubstr("Updated 2"));
        EXPECT_THAT(monitor.valuesOf("EF-MSISDN"), testing::Contains("+0010155550142"));
        EXPECT_THAT(monitor.valuesOf("APN"), testing::Contains("internet.example"));
        EXPECT_THAT(monitor.output(), Not(HasSubstr("(unknown)")));
        EXPECT_EQ(monitor.terminate(), 0);
    }
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
    EXPECT_LE(elapsed.restart(), 3500); // the next tick
    ASSERT_TRUE(monitor.waitForError("Could not create KoratServerConnection"));
    EXPECT_LE(elapsed.elapsed(), 1000); // at once
    EXPECT_TRUE(monitor.waitForOutput("Connecting...", 2));

    korat = std::make_unique<KoratProgram>(folder, QStringList{"--seed", "99"});
    const auto before = monitor.valuesOf("Measured RSRP").size();
    EXPECT_TRUE(waitUntil([&] { return monitor.valuesOf("Measured RSRP").size() > before + 1; }, 20s));
    EXPECT_THAT(monitor.errors(), Not(HasSubstr("already exists")));
}

class Fault : public testing::TestWithParam<std::pair<const char*, const char*>> { };

INSTANTIATE_TEST_SUITE_P(LiveSession, Fault,
    testing::Values(std::pair("refuse-channel=35",
                        "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 35!"),
        std::pair("null-port", "Could not create a log channel (Korat returned null port)!"),
        std::pair("no-reply", " ***** No response to GetTechnology; cannot configure"),
        std::pair("bad-reply", " ***** Could not parse reply to GetTechnology; cannot configure"),
        std::pair("unknown-technology", "No log generator technology works")),
    [](const auto& each) {
        QString name = each.param.first;
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
