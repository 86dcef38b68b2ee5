// The parts of koratd, without a process or a socket.

#include "CaptureSource.h"
#include "Recorder.h"
#include "Streamer.h"

#include "Array.h"
#include "Captures.h"
#include "FakeTelephony.h"
#include "ManualRunLoop.h"
#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gtest/gtest.h>

#include <thread>

namespace orvex::test {
namespace {

using namespace korat;
using namespace std::chrono_literals;

TEST(Subscription, TakesTheCodesThatTheCommandNames)
{
    const LogCode sample[] = {0xB179, 0xB17F, 0xFF0000, 0xFF0002};
    const auto list = [](const char* key, Value codes) { return Dictionary::make({{key, codes}}); };
    const auto both = list("SetMarlinLogCodes", Array::make({0xB17F}));
    both->set("SetKoratExtraCodes", Array::make({2}));
    const std::pair<DictionaryRef, std::set<LogCode>> cases[] = {
        // the codes of the sample that are wanted
        {Dictionary::make(), {std::begin(sample), std::end(sample)}},
        {both, {0xB17F, 0xFF0002}},
        {list("SetMarlinLogCodes", Array::make({0xB179, 0xB17F})), {0xB179, 0xB17F}},
        {list("SetMarlinLogCodes", Array::make({"45433", 0xB179 + 0x10000, -1, 45433.0})), {}},
        {list("SetMarlinLogCodes", "all"), {}},
    };
    for (const auto& [command, wanted] : cases) {
        const Subscription subscription(*command);
        for (const LogCode code : sample)
            EXPECT_EQ(subscription.wants(code), wanted.contains(code)) << wanted.size() << ": " << code;
        EXPECT_TRUE(subscription.wants(std::nullopt));
    }
}

TEST(Recorder, SaysOnceThatAMessageIsTooLongForReadersAndGoesOn)
{
    const TemporaryFile file;
    testing::internal::CaptureStderr();
    {
        Recorder recorder(file.path);
        recorder.reportCut();
        for (const std::size_t length : {262'144U, 262'145U, 16U << 20, 5U})
            recorder.write(Bytes(length, 1), 1s);
        recorder.reportCut();
    }
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
        "koratd: a message of 262145 bytes is too long for the recording; only its first 262144 bytes were "
        "written\n"
        "koratd: 2 messages were cut in the recording; a replay skips them\n");
    const auto replay = CaptureReader::open(file.path);
    for (const std::size_t length : {262'144U, 5U}) {
        ASSERT_EQ(replay->next(), CaptureReader::Status::message) << replay->error();
        EXPECT_EQ(replay->message().size(), length);
    }
    EXPECT_EQ(replay->next(), CaptureReader::Status::end) << replay->error();
}

// A client that takes what it is sent only when the test says so.
struct SlowClient final : FakePort<RemotePort> {
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
    void stream(const DictionaryRef& command, const Streamer::Pace& pace, std::unique_ptr<Source> source)
    {
        streamer = std::make_unique<Streamer>(runLoop, client, std::move(source), Subscription(*command),
            GarbageSource(0), pace, Streamer::Listener());
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

    ManualRunLoop runLoop;
    std::shared_ptr<SlowClient> client = std::make_shared<SlowClient>();
    std::unique_ptr<Streamer> streamer;
};

TEST_F(StreamerTest, StandsStillAboveItsBacklogAndDropsNothing)
{
    constexpr std::size_t kBacklog = std::size_t{4} << 20;
    constexpr std::size_t kLargestMessage = 1 << 16;
    const std::string capture = capturePath("MRL_LTE");
    client->refusals = 3;
    stream(Dictionary::make(), {1e6, std::nullopt}, std::make_unique<CaptureSource>(capture, false));
    ASSERT_TRUE(tickUntil([&] { return client->pending > kBacklog; }));
    const std::size_t sent = client->received.size();
    tickUntil([] { return false; }, 5);
    EXPECT_EQ(client->received.size(), sent);
    EXPECT_LE(client->pending, kBacklog + kLargestMessage);

    client->pending = 0;
    ASSERT_TRUE(tickUntil([&] { return client->received.size() > sent + 100; }));
    CaptureSource source(capture, false);
    for (const Bytes& message : client->received) {
        auto expected = source.next({});
        if (!expected && source.restart())
            expected = source.next({});
        ASSERT_EQ(message, expected->bytes);
    }
}

TEST_F(StreamerTest, RestsAfterTheEndAndRepeatsOnlyWhatIsWanted)
{
    const TemporaryFile file;
    const std::tuple<const char*, int, std::uint8_t, bool, std::optional<std::uint64_t>, std::size_t, bool>
        cases[] = {
            {"one round", 1, 3, true, {}, 3, true},
            {"endless", 1, 3, false, {}, 30, false},
            {"so many of those that are wanted", 1, 3, false, 30, 30, true},
            {"endless, nothing in it", 1, 0, false, {}, 0, true},
            {"endless, nothing wanted in it", 2, 3, false, {}, 0, true},
        };
    for (const auto& [name, wantedCode, length, once, count, atLeast, rests] : cases) {
        client->received.clear();
        {
            PcapWriter capture(file.path);
            for (std::uint8_t i = 0; i < 2 * length; ++i) // every other one is never wanted
                capture.write(
                    Bytes{1, 13, 0, static_cast<std::uint8_t>(i % 2 ? 1 : 3), 0, 0, 0, 0, 0, 0, 0, 0, 0, i},
                    {});
        }
        stream(Dictionary::make({{"SetMarlinLogCodes", Array::make({wantedCode})}}), {2000, count},
            std::make_unique<CaptureSource>(file.path, once));
        tickUntil([] { return false; }, 30);
        EXPECT_EQ(runLoop.timerCount(), rests ? 0U : 1U) << name;
        EXPECT_GE(client->received.size(), atLeast) << name;
        EXPECT_TRUE(!rests || client->received.size() == atLeast) << name;
        for (std::size_t i = 0; i < client->received.size(); ++i)
            EXPECT_EQ(client->received[i].at(13), i % length * 2 + 1) << name;
    }
}

} // namespace
} // namespace orvex::test
