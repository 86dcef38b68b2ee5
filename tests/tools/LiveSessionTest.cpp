// The whole road with real programs: koratd, the monitor, and captures of what went between them.

#include "Captures.h"
#include "KoratClient.h"
#include "Programs.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <thread>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

class LiveSession : public testing::Test {
protected:
    using Captured = std::pair<std::chrono::microseconds, Bytes>; // since the first message

    std::vector<Captured> messagesIn(const char* name) const
    {
        std::vector<Captured> result;
        const auto reader = CaptureReader::open(folder.path(name));
        std::optional<std::chrono::microseconds> start;
        while (reader->next() == CaptureReader::Status::message) {
            start = start.value_or(reader->time());
            result.emplace_back(
                reader->time() - *start, Bytes(reader->message().begin(), reader->message().end()));
        }
        return result;
    }

    const ProgramFolder folder{};
};

TEST_F(LiveSession, RecordedPlayedAndRecordedAgainItIsTheSame)
{
    constexpr std::size_t kCount = 2000; // several rounds of most captures
    for (const char* technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const auto record = [&](const char* name, const QStringList& arguments) {
            KoratProgram korat(folder,
                QStringList{"--technology", technology, "--rate", "20000", "--record", folder.name(name)}
                    + arguments);
            KoratClient client(folder.ports());
            EXPECT_EQ(client.open(), 0);
            EXPECT_EQ(client.technology(), Value(technology));
            client.send();
            EXPECT_TRUE(waitUntil([&] { return client.messages.size() >= kCount; }, 20s));
            turnFor(50ms); // in which nothing more comes
            EXPECT_EQ(korat.terminateAndCount(), kCount);
            return client.messages;
        };
        const auto received = record("first", {"--count", QString::number(kCount)});
        EXPECT_TRUE(record("second", {"--capture", folder.name("first"), "--once"}) == received);
        const auto first = messagesIn("first");
        ASSERT_EQ(first.size(), kCount);
        EXPECT_TRUE(std::ranges::equal(first, received, {}, &Captured::second));
        EXPECT_TRUE(first == messagesIn("second"));
        // Messages stand at the capture's times, however fast they went.
        EXPECT_GT(first.back().first, 20s);
        EXPECT_TRUE(std::ranges::is_sorted(first, {}, &Captured::first));
    }
}

TEST_F(LiveSession, MonitorAndDecoderShowTheSameOfIt)
{
    constexpr std::size_t kCount = 3000;
    for (const char* technology : {"MRL_LTE", "MRL_CDMA"}) {
        SCOPED_TRACE(technology);
        std::string live;
        {
            const KoratProgram korat(folder,
                {"--technology", technology, "--rate", "10000", "--count", QString::number(kCount),
                    "--record", folder.name("live")});
            Program monitor(folder, ORVEX_PATH, {"--console"});
            EXPECT_TRUE(waitUntil([&] { return messagesIn("live").size() == kCount; }, 30s));
            turnFor(2500ms); // a refresh comes every two seconds
            EXPECT_EQ(monitor.terminate(), 0);
            live = monitor.output();
        }
        live.erase(0, live.find('\n', live.rfind("Updated ")) + 1);
        EXPECT_GT(live.size(), 500U);
        EXPECT_EQ(live, run(ORVEX_DECODE, {"--technology", technology, folder.name("live")}).output);
    }
}

TEST_F(LiveSession, AServiceThatHasGoneIsHeardToItsLastMessage)
{
    KoratProgram korat(folder, {"--rate", "100", "--count", "300"});
    const Program monitor(folder, ORVEX_PATH, {"--print-status"});
    ASSERT_TRUE(monitor.waitFor(" Updated "));
    // The monitor stands still until its next refresh is due, which finds the service gone.
    ::kill(monitor.id(), SIGSTOP);
    std::this_thread::sleep_for(1800ms);
    korat.kill();
    std::this_thread::sleep_for(500ms);
    ::kill(monitor.id(), SIGCONT);
    EXPECT_TRUE(monitor.waitFor("\n300 ")) << monitor.output();
}

} // namespace
} // namespace orvex::test
