// The parts of koratd, without a process or a socket.

#include "Recorder.h"
#include "Streamer.h"

#include "Captures.h"
#include "Decoding.h"
#include "FakeTelephony.h"
#include "ManualRunLoop.h"
#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gtest/gtest.h>

#include <thread>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

TEST(Subscription, TakesTheCodesThatTheCommandNames)
{
    const LogCode sample[] = {0xB179, 0xB17F, 0xFF0000, 0xFF0002};
    const struct {
        const char* name;
        DictionaryRef command;
        std::set<LogCode> wanted; // of the sample
    } cases[] = {
        {"no lists: everything", Dictionary::make(), {std::begin(sample), std::end(sample)}},
        {"both lists",
            Dictionary::make(
                {{"SetMarlinLogCodes", Array::make({0xB17F})}, {"SetKoratExtraCodes", Array::make({2})}}),
            {0xB17F, 0xFF0002}},
        {"one list: no extra packets",
            Dictionary::make({{"SetMarlinLogCodes", Array::make({0xB179, 0xB17F})}}), {0xB179, 0xB17F}},
        {"empty list: nothing", Dictionary::make({{"SetMarlinLogCodes", Array::make()}}), {}},
        {"no codes in the list",
            Dictionary::make({{"SetMarlinLogCodes", Array::make({"45433", 0xB179 + 0x10000, -1, 45433.0})}}),
            {}},
        {"no list at all", Dictionary::make({{"SetMarlinLogCodes", "all"}}), {}},
    };
    for (const auto& [name, command, wanted] : cases) {
        const Subscription subscription(*command);
        for (const LogCode code : sample)
            EXPECT_EQ(subscription.wants(code), wanted.contains(code)) << name << ": " << code;
        EXPECT_TRUE(subscription.wants(std::nullopt)) << name;
    }
}

TEST(GarbageSource, NothingOfItIsFatalToAGenerator)
{
    for (const char* technology : test::kTechnologies) {
        SCOPED_TRACE(technology);
        const bool arePackets = technology != std::string_view(telephony::kTechnologyIFX);
        GarbageSource garbage(50);
        test::Decoding decoding(technology);
        std::size_t messages = 0;
        std::size_t changed = 0;
        for (int round = 0; round < (arePackets ? 8 : 1); ++round) {
            CaptureSource source(test::capturePath(technology), true);
            while (auto message = source.next()) {
                const Bytes before = message->bytes;
                garbage.spoil(*message);
                ++messages;
                changed += message->bytes == before ? 0U : 1U;
                ASSERT_NO_THROW(decoding.feed(message->bytes)) << messages;
            }
        }
        const auto count = static_cast<double>(messages);
        EXPECT_NEAR(static_cast<double>(changed), arePackets ? count / 2 : 0, count / 20);
    }
}

TEST(Recorder, SaysOnceThatAMessageIsTooLongAndGoesOn)
{
    const test::TemporaryFile file;
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
}

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
    void stream(const DictionaryRef& command, const Streamer::Pace& pace, CaptureSource source)
    {
        streamer = std::make_unique<Streamer>(runLoop, client, std::move(source), Subscription(*command),
            GarbageSource(0), pace, [this](const Message& message) { told.push_back(message.bytes); });
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
    const std::string capture = test::capturePath("MRL_LTE");
    client->refusals = 3;
    stream(Dictionary::make(), {1e6, std::nullopt}, {capture, false});
    ASSERT_TRUE(tickUntil([&] { return client->pending > kBacklog; }));
    const std::size_t sent = client->received.size();
    tickUntil([] { return false; }, 5);
    EXPECT_EQ(client->received.size(), sent);
    EXPECT_LE(client->pending, kBacklog + kLargestMessage);

    client->pending = 0;
    ASSERT_TRUE(tickUntil([&] { return client->received.size() > sent + 100; }));
    EXPECT_EQ(streamer->sent(), client->received.size());
    EXPECT_EQ(told, client->received);
    CaptureSource source(capture, false);
    for (const Bytes& message : client->received) {
        auto expected = source.next();
        if (!expected && source.restart())
            expected = source.next();
        ASSERT_EQ(message, expected->bytes);
    }
}

TEST_F(StreamerTest, RestsAfterTheEndAndRepeatsOnlyWhatIsWanted)
{
    const test::TemporaryFile file;
    const struct {
        const char* name;
        int wantedCode;
        std::size_t length;
        bool once;
        std::optional<std::uint64_t> count;
        std::size_t atLeast;
        bool rests;
    } cases[] = {
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
            for (std::uint8_t i = 0; i < length; ++i) {
                capture.write(Bytes{1, 13, 0, 3, 0, 0, 0, 0, 0, 0, 0, 0, 0, i}, {}); // never wanted
                capture.write(Bytes{1, 13, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0, i}, {});
            }
        }
        stream(Dictionary::make({{"SetMarlinLogCodes", Array::make({wantedCode})}}), {2000, count},
            {file.path, once});
        tickUntil([] { return false; }, 30);
        EXPECT_EQ(runLoop.timerCount(), rests ? 0U : 1U) << name;
        EXPECT_GE(client->received.size(), atLeast) << name;
        EXPECT_TRUE(!rests || client->received.size() == atLeast) << name;
        for (std::size_t i = 0; i < client->received.size(); ++i)
            EXPECT_EQ(client->received[i].at(13), i % length) << name;
    }
}

} // namespace
} // namespace orvex::korat
