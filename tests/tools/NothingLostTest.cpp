// A real session of the application, inside the test, with koratd as a program.

#include "KoratProgram.h"

#include "FileStorage.h"
#include "KoratTelephonyService.h"
#include "OrvexModel.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

// A session of the application inside the test.
class Session {
public:
    explicit Session(const ProgramFolder& folder)
        : _ports(folder.ports())
    {
        _model->restartMonitor();
    }
    std::size_t messages() const { return _model->decodedMessages(); }

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

TEST(NothingLost, EveryMessageSentIsDecodedAtItsPace)
{
    for (const auto& [rate, count] : {std::pair(2000, 10'000U), std::pair(20'000, 40'000U)}) {
        const ProgramFolder folder;
        KoratProgram korat(folder, {"--rate", QString::number(rate), "--count", QString::number(count)});

        QElapsedTimer elapsed;
        elapsed.start();
        const Session session(folder);
        EXPECT_TRUE(waitUntil([&, wanted = count] { return session.messages() >= wanted; }, 60s));
        EXPECT_GE(elapsed.elapsed(), static_cast<qint64>(count * 1000) / rate - 100);
        turnFor(200ms);
        EXPECT_EQ(session.messages(), count);
        EXPECT_EQ(korat.terminateAndCount(), count);
    }
}

TEST(NothingLost, AServiceThatHasGoneIsHeardToItsLastMessage)
{
    constexpr std::size_t kCount = 150;
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", "100", "--count", QString::number(kCount)});
    const Session session(folder);
    EXPECT_TRUE(waitUntil([&] { return session.messages() > 0; }));

    // The event loop stands still until a refresh is due, which finds the service gone.
    std::this_thread::sleep_for(1800ms);
    korat.kill();
    std::this_thread::sleep_for(500ms);
    EXPECT_TRUE(waitUntil([&] { return session.messages() >= kCount; })) << session.messages();
}

} // namespace
} // namespace orvex::test
