// The whole road with real programs: koratd, and the monitor in a terminal.

#include "KoratProgram.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using testing::HasSubstr;
using testing::Not;

class ConsoleProgram : public Program {
public:
    explicit ConsoleProgram(const ProgramFolder& folder)
        : Program(folder, ORVEX_PATH, {"--console"})
    {
    }
};

TEST(LiveSession, EndsWhenItsWindowWasPaintedIfItIsTo)
{
    const ProgramFolder folder;
    Program monitor(folder, ORVEX_PATH, {"--until-painted"});
    EXPECT_EQ(monitor.waitForEnd(), 0) << monitor.errors();
    EXPECT_EQ(monitor.output(), "painted\n");
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

    const auto before = static_cast<int>(QString::fromStdString(monitor.output()).count("Updated 2"));
    korat = std::make_unique<KoratProgram>(folder);
    EXPECT_TRUE(monitor.waitForOutput("Updated 2", before + 2));
    EXPECT_THAT(monitor.errors(), Not(HasSubstr("already exists")));
}

TEST(LiveSession, AFaultIsLoggedAndLeavesTheMonitorConnecting)
{
    const std::pair<const char*, const char*> cases[] = {
        {"refuse-channel=35", "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 35!"},
        {"null-port", "Could not create a log channel (Korat returned null port)!"},
        {"no-reply", " ***** No response to GetTechnology; cannot configure"},
        {"bad-reply", " ***** Could not parse reply to GetTechnology; cannot configure"},
        {"unknown-technology", "No log generator technology works"},
    };
    for (const auto& [fault, line] : cases) {
        const ProgramFolder folder;
        const KoratProgram korat(folder, {"--fault", fault});
        ConsoleProgram monitor(folder);
        EXPECT_TRUE(monitor.waitForError(line)) << fault;
        EXPECT_THAT(monitor.output(), Not(HasSubstr("Updated")));
        EXPECT_EQ(monitor.terminate(), 0) << monitor.errors();
    }
}

} // namespace
} // namespace orvex::test
