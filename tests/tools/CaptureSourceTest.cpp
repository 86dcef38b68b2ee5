#include "CaptureSource.h"

#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

using Times = std::vector<Microseconds>;

constexpr Microseconds kLongAgo = 1'600'000'000s;

// A packet of that time, behind bytes that are no part of it.
Bytes packetAt(Microseconds time, const Bytes& prefix = {})
{
    Bytes packet = prefix;
    packet.insert(packet.end(), {1, 12, 0, 0xC1, 0xB0});
    for (std::size_t i = 0; i < 8; ++i)
        packet.push_back(static_cast<std::uint8_t>(time.count() >> (8 * i)));
    return packet;
}

class CaptureSourceTest : public testing::Test {
protected:
    void writePcap(const std::vector<Bytes>& messages, const Times& times) const
    {
        PcapWriter writer(path);
        for (std::size_t i = 0; i < messages.size(); ++i)
            writer.write(messages[i], kLongAgo + times[i]);
    }

    static std::vector<Message> round(CaptureSource& source)
    {
        std::vector<Message> result;
        while (auto message = source.next({}))
            result.push_back(std::move(*message));
        return result;
    }
    // When the messages of one round are due.
    static Times duesOf(CaptureSource& source)
    {
        Times result;
        std::ranges::transform(round(source), std::back_inserter(result), &Message::due);
        return result;
    }

    const test::TemporaryFile file;
    const std::string& path = file.path;
};

TEST_F(CaptureSourceTest, PaceIsThatOfTheCaptureWhereItHasOneAndRoundsFollowAfterASecond)
{
    const std::tuple<const char*, Times, Times> cases[] = {
        {"as captured", {5s, 5s + 3us, 6s}, {0s, 3us, 1s}},
        {"a minute is a pause", {0s, 60s, 61s}, {0s, 60s, 61s}},
        {"more is another session", {0s, 60s + 1us, 61s}, {0s, 0s, 1s - 1us}},
        {"time goes back", {10s, 4s, 7s}, {0s, 0s, 3s}},
    };
    for (const auto& [name, captured, due] : cases) {
        writePcap(std::vector<Bytes>(captured.size(), packetAt(0s)), captured);
        EXPECT_FALSE(CaptureSource(path, true).restart()) << name;
        CaptureSource source(path, false);
        auto expected = due;
        for (int round = 0; round < 3; ++round) {
            EXPECT_EQ(duesOf(source), expected) << name;
            ASSERT_TRUE(source.restart());
            for (Microseconds& time : expected)
                time += due.back() + 1s;
        }
    }
}

TEST_F(CaptureSourceTest, TimesInPacketsGoOnFromRoundToRound)
{
    const Bytes list{'<', 'p', 'l', 'i', 's', 't', '>', 1, 2, 3, 4, 5, 6, 7};
    const Bytes shortPacket{0x81, 7, 1, 12, 0, 0xC1, 0xB0, 1, 2, 3, 4, 5, 6}; // ends within its time
    writePcap({packetAt(kLongAgo), list, packetAt(kLongAgo + 2h, {0x81, 7}), shortPacket}, Times(4, 0s));
    CaptureSource source(path, false);
    for (int count = 0; count < 3; ++count) {
        const auto played = round(source);
        ASSERT_EQ(played.size(), 4U);
        const Microseconds time =
            kLongAgo + count * (2h + 1s); // longer than they are due: the pace leaves out pauses
        EXPECT_EQ(played[0].bytes, packetAt(time));
        EXPECT_EQ(played[1].bytes, list);
        EXPECT_EQ(played[2].bytes, packetAt(time + 2h, {0x81, 7}));
        EXPECT_EQ(played[3].bytes, shortPacket);
        ASSERT_TRUE(source.restart());
    }

    writePcap({packetAt(10s), packetAt(4s)}, {0s, 0s}); // the second one has another clock
    CaptureSource odd(path, false);
    round(odd);
    odd.restart();
    EXPECT_EQ(round(odd).front().bytes, packetAt(11s));
}

TEST_F(CaptureSourceTest, MessagesAreWantedByTheCodesInTheirHeaders)
{
    const Bytes packet = packetAt(0s);
    const std::pair<Bytes, std::optional<LogCode>> cases[] = {
        {packet, 0xB0C1}, {{255, 12, 0, 2, 1, 6, 7, 8, 9, 10, 11, 12, 13}, 0xFF0102}, // an extra packet
        {{0x81, 255, 1, 9, 9, 0x79, 0xB1, 8, 9, 10, 11, 12, 13}, 0xB179},             // behind a prefix
        {{0x81, 1, 255, 9, 9, 2, 0, 8, 9, 10, 11, 12, 13}, 0xFF0002},
        {Bytes(packet.begin(), packet.end() - 1), std::nullopt}, // shorter than a header
        {Bytes(20, 2), std::nullopt},                            // another log type
    };
    for (const auto& [bytes, code] : cases) {
        writePcap({bytes}, {0s});
        const auto message = CaptureSource(path, true).next({});
        ASSERT_TRUE(message);
        EXPECT_EQ(message->code, code) << testing::PrintToString(bytes);
        EXPECT_EQ(message->bytes, bytes);
    }
}

TEST_F(CaptureSourceTest, CaptureThatBreaksIsPlayedUpToThereAndSaysSoOnce)
{
    writePcap({packetAt(0s), packetAt(1s)}, {0s, 1s});
    std::filesystem::resize_file(path, std::filesystem::file_size(path) - 1);
    EXPECT_EQ(CaptureSource::faultOf(path), "");
    CaptureSource source(path, false);
    testing::internal::CaptureStderr();
    EXPECT_EQ(duesOf(source), Times{0s});
    EXPECT_THAT(testing::internal::GetCapturedStderr(), testing::HasSubstr("truncated"));
    ASSERT_TRUE(source.restart());
    testing::internal::CaptureStderr();
    EXPECT_EQ(duesOf(source), Times{1s});
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

} // namespace
} // namespace orvex::korat
