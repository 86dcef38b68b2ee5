#include "service/Streamer.h"

#include "scenarios/ScenarioTable.h"

#include "FakeTelephony.h"
#include "ManualRunLoop.h"

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

class StreamerTest : public testing::Test {
protected:
    void stream(const DictionaryRef& command, const Streamer::Pace& pace)
    {
        stream(command, pace, findScenario("MRL_LTE", "")->make({}));
    }
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
    void tick(int times)
    {
        tickUntil([] { return false; }, times);
    }

    test::ManualRunLoop runLoop;
    std::shared_ptr<SlowClient> client = std::make_shared<SlowClient>();
    std::vector<Bytes> told; // by the streamer, of what it sent
    std::unique_ptr<Streamer> streamer;
};

// A few messages of code 1, again and again, or not.
class Rounds final : public MessageSource {
public:
    Rounds(std::size_t length, bool isLooped)
        : _length(length)
        , _isLooped(isLooped)
    {
    }

    std::optional<Item> nextIfAny() override
    {
        if (_place == _length)
            return std::nullopt;
        ++_place;
        return Item{{}, {1, Bytes(20, static_cast<std::uint8_t>(_place))}};
    }
    bool restart() override
    {
        _place = 0;
        return _isLooped;
    }
    std::vector<LogCode> codes() const override { return {}; }

private:
    std::size_t _length;
    bool _isLooped;
    std::size_t _place = 0;
};

TEST_F(StreamerTest, StandsStillAboveItsBacklogAndDropsNothing)
{
    constexpr std::size_t kBacklog = std::size_t{4} << 20;
    constexpr std::size_t kLargestMessage = 1 << 16;
    client->refusals = 3;
    stream(Dictionary::make(), {1e6, std::nullopt});
    ASSERT_TRUE(tickUntil([&] { return client->pending > kBacklog; }));
    const std::size_t sent = client->received.size();
    tick(5);
    EXPECT_EQ(client->received.size(), sent);
    EXPECT_LE(client->pending, kBacklog + kLargestMessage);

    client->pending = 0;
    ASSERT_TRUE(tickUntil([&] { return client->received.size() > sent + 100; }));
    EXPECT_EQ(streamer->sent(), client->received.size());
    EXPECT_EQ(told, client->received);
    const auto scenario = findScenario("MRL_LTE", "")->make({});
    for (const Bytes& message : client->received)
        ASSERT_EQ(message, scenario->next().message.bytes);
}

TEST_F(StreamerTest, CountsOnlyMessagesThatTheClientWants)
{
    stream(Dictionary::make({{"SetMarlinLogCodes", Array::make({0xB0C1})}}), {2000, 30});
    ASSERT_TRUE(tickUntil([&] { return runLoop.timerCount() == 0; })); // it rests
    EXPECT_EQ(client->received.size(), 30U);
    for (const Bytes& message : client->received)
        EXPECT_EQ(message.at(3), 0xC1);
}

TEST_F(StreamerTest, RestsAfterTheEndAndLoopsOnlyWhatIsWanted)
{
    const auto wanted = Dictionary::make({{"SetMarlinLogCodes", Array::make({1})}});
    const auto unwanted = Dictionary::make({{"SetMarlinLogCodes", Array::make({2})}});
    const struct {
        const char* name;
        DictionaryRef command;
        std::size_t length;
        std::size_t atLeast;
        bool isLooped;
        bool rests;
    } cases[] = {
        {"one round", wanted, 3, 3, false, true},
        {"endless", wanted, 3, 30, true, false},
        {"endless, nothing in it", wanted, 0, 0, true, true},
        {"endless, nothing wanted in it", unwanted, 3, 0, true, true},
    };
    for (const auto& [name, command, length, atLeast, isLooped, rests] : cases) {
        client->received.clear();
        stream(command, {2000, std::nullopt}, std::make_unique<Rounds>(length, isLooped));
        tick(30);
        EXPECT_EQ(runLoop.timerCount(), rests ? 0U : 1U) << name;
        ASSERT_GE(client->received.size(), atLeast) << name;
        for (std::size_t i = 0; i < client->received.size(); ++i)
            EXPECT_EQ(client->received[i].at(0), i % length + 1) << name;
        if (rests) {
            EXPECT_EQ(client->received.size(), atLeast) << name;
        }
    }
}

} // namespace
} // namespace orvex::korat
