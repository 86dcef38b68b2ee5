#include "replay/ReplaySource.h"

#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;

constexpr Microseconds kLongAgo = 1'600'000'000s;
const Bytes kPacket = {1, 12, 0, 0xC1, 0xB0, 0, 0, 0, 0, 0, 0, 0, 0};

class ReplaySourceTest : public testing::Test {
protected:
    void writePcap(const std::vector<Bytes>& messages, const std::vector<Microseconds>& times) const
    {
        PcapWriter writer(path);
        for (std::size_t i = 0; i < messages.size(); ++i)
            writer.write(messages[i], kLongAgo + times[i]);
    }

    // When the messages of one round are due.
    static std::vector<Microseconds> duesOf(ReplaySource& source)
    {
        std::vector<Microseconds> result;
        while (const auto item = source.nextIfAny())
            result.push_back(item->due);
        return result;
    }

    const test::TemporaryFile file;
    const std::string& path = file.path;
};

TEST_F(ReplaySourceTest, PaceIsThatOfTheCaptureWhereItHasOneAndRoundsFollowAfterASecond)
{
    using Times = std::vector<Microseconds>;
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
        writePcap(std::vector<Bytes>(captured.size(), kPacket), captured);
        EXPECT_FALSE(ReplaySource(path, false).restart()) << name;
        ReplaySource looped(path, true);
        auto expected = due;
        for (int round = 0; round < 3; ++round) {
            EXPECT_EQ(duesOf(looped), expected) << name;
            ASSERT_TRUE(looped.restart());
            for (Microseconds& time : expected)
                time += due.back() + 1s;
        }
    }
}

TEST_F(ReplaySourceTest, MessagesAreWantedByTheCodesInTheirHeaders)
{
    const struct {
        const char* name;
        Bytes message;
        std::optional<LogCode> code;
    } cases[] = {
        {"baseband packet", kPacket, 0xB0C1},
        {"extra packet", {255, 12, 0, 2, 1, 6, 7, 8, 9, 10, 11, 12, 13}, 0xFF0102},
        {"behind a prefix", {0x81, 255, 1, 9, 9, 0x79, 0xB1, 8, 9, 10, 11, 12, 13}, 0xB179},
        {"extra packet behind a prefix", {0x81, 1, 255, 9, 9, 2, 0, 8, 9, 10, 11, 12, 13}, 0xFF0002},
        {"shorter than a header", Bytes(kPacket.begin(), kPacket.end() - 1), std::nullopt},
        {"another log type", Bytes(20, 2), std::nullopt},
    };
    for (const auto& [name, message, code] : cases) {
        writePcap({message}, {0s});
        const auto item = ReplaySource(path, false).nextIfAny();
        ASSERT_TRUE(item) << name;
        EXPECT_EQ(item->message.code, code) << name;
        EXPECT_EQ(item->message.bytes, message) << name;
    }
}

TEST_F(ReplaySourceTest, CaptureThatBreaksIsPlayedUpToThereAndSaysSoOnce)
{
    writePcap({kPacket, kPacket}, {0s, 1s});
    std::filesystem::resize_file(path, std::filesystem::file_size(path) - 1);
    EXPECT_EQ(ReplaySource::faultOf(path), "");
    ReplaySource source(path, true);
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
