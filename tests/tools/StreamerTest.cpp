#include "service/Streamer.h"

#include "replay/ReplaySource.h"
#include "scenarios/ScenarioTable.h"

#include "FakeTelephony.h"
#include "ManualRunLoop.h"
#include "PcapWriter.h"
#include "TemporaryFile.h"

#include "Array.h"

#include <gtest/gtest.h>

#include <thread>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

// A client that takes what it is sent only when the test says so.
struct SlowClient final : test::FakePort<RemotePort> {
    Status send(std::int32_t, ByteView data, std::chrono::milliseconds) override
    {
        if (refusals > 0) {
            --refusals;
            return Status::sendTimeout;
        }
        pending += data.size();
        received.emplace_back(data.begin(), data.end());
        return Status::success;
    }
    SendResult request(std::int32_t, ByteView, std::chrono::milliseconds, std::chrono::milliseconds) override
    {
        return {};
    }
    std::size_t pendingBytes() const override { return pending; }

    std::size_t pending = 0;
    int refusals = 0;
    std::vector<Bytes> received;
};

std::unique_ptr<MessageSource> lteTown()
{
    return findScenario("MRL_LTE", "")->make({});
}

class StreamerTest : public testing::Test {
protected:
    void stream(
        const DictionaryRef& command, const Streamer::Pace& pace, std::unique_ptr<MessageSource> source)
    {
        streamer = std::make_unique<Streamer>(runLoop, client, std::move(source), Subscription(*command),
            GarbageSource(0, 1), pace,
            [this](const MessageSource::Item& item) { told.push_back(item.message.bytes); });
    }
    // Lets the run loop tick while real time goes on.
    bool tickUntil(const std::function<bool()>& condition, int times = 2000)
    {
        for (int i = 0; i < times && !condition(); ++i) {
            std::this_thread::sleep_for(2ms);
            runLoop.advance(10ms);
        }
        return condition();
    }

    test::ManualRunLoop runLoop;
    std::shared_ptr<SlowClient> client = std::make_shared<SlowClient>();
    std::vector<Bytes> told; // by the streamer, of what it sent
    std::unique_ptr<Streamer> streamer;
};

TEST_F(StreamerTest, StandsStillAboveItsBacklogAndDropsNothing)
{
    constexpr std::size_t kBacklog = std::size_t{4} << 20;
    constexpr std::size_t kLargestMessage = 1 << 16;
    client->refusals = 3;
    stream(Dictionary::make(), {1e6, std::nullopt}, lteTown());
    ASSERT_TRUE(tickUntil([&] { return client->pending > kBacklog; }));
    const std::size_t sent = client->received.size();
    tickUntil([] { return false; }, 5);
    EXPECT_EQ(client->received.size(), sent);
    EXPECT_LE(client->pending, kBacklog + kLargestMessage);

    client->pending = 0;
    ASSERT_TRUE(tickUntil([&] { return client->received.size() > sent + 100; }));
    EXPECT_EQ(streamer->sent(), client->received.size());
    EXPECT_EQ(told, client->received);
    const auto scenario = lteTown();
    for (const Bytes& message : client->received)
        ASSERT_EQ(message, scenario->nextIfAny()->message.bytes);
}

TEST_F(StreamerTest, RestsAfterTheEndAndLoopsOnlyWhatIsWanted)
{
    const test::TemporaryFile file;
    const struct {
        const char* name;
        int wantedCode;
        std::size_t length;
        bool isLooped;
        std::optional<std::uint64_t> count;
        std::size_t atLeast;
        bool rests;
    } cases[] = {
        {"one round", 1, 3, false, {}, 3, true},
        {"endless", 1, 3, true, {}, 30, false},
        {"so many of those that are wanted", 1, 3, true, 30, 30, true},
        {"endless, nothing in it", 1, 0, true, {}, 0, true},
        {"endless, nothing wanted in it", 2, 3, true, {}, 0, true},
    };
    for (const auto& [name, wantedCode, length, isLooped, count, atLeast, rests] : cases) {
        client->received.clear();
        {
            PcapWriter capture(file.path);
            for (std::uint8_t i = 0; i < length; ++i) {
                capture.write(Bytes{1, 12, 0, 3, 0, 0, 0, 0, 0, 0, 0, 0, i}, {}); // never wanted
                capture.write(Bytes{1, 12, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0, i}, {});
            }
        }
        stream(Dictionary::make({{"SetMarlinLogCodes", Array::make({wantedCode})}}), {2000, count},
            std::make_unique<ReplaySource>(file.path, isLooped));
        tickUntil([] { return false; }, 30);
        EXPECT_EQ(runLoop.timerCount(), rests ? 0U : 1U) << name;
        EXPECT_GE(client->received.size(), atLeast) << name;
        EXPECT_TRUE(!rests || client->received.size() == atLeast) << name;
        for (std::size_t i = 0; i < client->received.size(); ++i)
            EXPECT_EQ(client->received[i].at(12), i % length) << name;
    }
}

} // namespace
} // namespace orvex::korat
