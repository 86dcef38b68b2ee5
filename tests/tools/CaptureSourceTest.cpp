#include "CaptureSource.h"

#include "PacketReader.h"
#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;

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

Microseconds timeOf(const Bytes& packet)
{
    const PacketReader reader(packet);
    const std::size_t offset = reader.u8(0) == 0x81 ? 7 : 5;
    return Microseconds(reader.u32(offset) | static_cast<std::int64_t>(reader.u32(offset + 4)) << 32);
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
        while (auto message = source.next())
            result.push_back(std::move(*message));
        return result;
    }
    // When the messages of one round are due.
    static Times duesOf(CaptureSource& source)
    {
        Times result;
        for (const Message& message : round(source))
            result.push_back(message.due);
        return result;
    }

    const test::TemporaryFile file;
    const std::string& path = file.path;
};

TEST_F(CaptureSourceTest, PaceIsThatOfTheCaptureWhereItHasOneAndRoundsFollowAfterASecond)
{
    const struct {
        const char* name;
        Times captured;
        Times due;
    } cases[] = {
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
    const std::vector<Bytes> messages = {
        packetAt(kLongAgo), list, packetAt(kLongAgo + 2h, {0x81, 7}), shortPacket};
    writePcap(messages, Times(messages.size(), 0s));
    CaptureSource source(path, false);
    for (int count = 0; count < 3; ++count) {
        const auto played = round(source);
        ASSERT_EQ(played.size(), messages.size());
        const Microseconds shift = count * (2h + 1s); // longer than they are due: the pace leaves out pauses
        for (const std::size_t packet : {0U, 2U})
            EXPECT_EQ(timeOf(played[packet].bytes), timeOf(messages[packet]) + shift) << count;
        for (const std::size_t other : {1U, 3U})
            EXPECT_EQ(played[other].bytes, messages[other]);
        EXPECT_TRUE(count > 0 || played[2].bytes == messages[2]) << "the first round is the capture";
        ASSERT_TRUE(source.restart());
    }

    writePcap({packetAt(10s), packetAt(4s)}, {0s, 0s}); // the second one has another clock
    CaptureSource odd(path, false);
    round(odd);
    odd.restart();
    EXPECT_EQ(timeOf(round(odd).front().bytes), 11s);
}

TEST_F(CaptureSourceTest, MessagesAreWantedByTheCodesInTheirHeaders)
{
    const Bytes packet = packetAt(0s);
    const struct {
        const char* name;
        Bytes message;
        std::optional<LogCode> code;
    } cases[] = {
        {"baseband packet", packet, 0xB0C1},
        {"extra packet", {255, 12, 0, 2, 1, 6, 7, 8, 9, 10, 11, 12, 13}, 0xFF0102},
        {"behind a prefix", {0x81, 255, 1, 9, 9, 0x79, 0xB1, 8, 9, 10, 11, 12, 13}, 0xB179},
        {"extra packet behind a prefix", {0x81, 1, 255, 9, 9, 2, 0, 8, 9, 10, 11, 12, 13}, 0xFF0002},
        {"shorter than a header", Bytes(packet.begin(), packet.end() - 1), std::nullopt},
        {"another log type", Bytes(20, 2), std::nullopt},
    };
    for (const auto& [name, bytes, code] : cases) {
        writePcap({bytes}, {0s});
        const auto message = CaptureSource(path, true).next();
        ASSERT_TRUE(message) << name;
        EXPECT_EQ(message->code, code) << name;
        EXPECT_EQ(message->bytes, bytes) << name;
    }
}

TEST_F(CaptureSourceTest, CaptureThatBreaksIsPlayedUpToThereAndSaysSoOnce)
{
    writePcap({packetAt(0s), packetAt(1s)}, {0s, 1s});
    std::filesystem::resize_file(path, std::filesystem::file_size(path) - 1);
    EXPECT_EQ(CaptureSource::faultOf(path), "");
    CaptureSource source(path, false);
    testing::internal::CaptureStderr();
    EXPECT_THAT(duesOf(source), ElementsAre(0s));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), HasSubstr("truncated"));
    ASSERT_TRUE(source.restart());
    testing::internal::CaptureStderr();
    EXPECT_THAT(duesOf(source), ElementsAre(1s));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

} // namespace
} // namespace orvex::korat
