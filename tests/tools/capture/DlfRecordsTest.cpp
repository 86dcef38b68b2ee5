#include "DlfRecords.h"

#include "Captures.h"
#include "DlfBytes.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace orvex {
namespace {

using namespace test;
using namespace std::chrono_literals;

constexpr int kNoType = -1;

using Found = std::pair<int, Bytes>; // the log type and the record

// Without spare capacity, in which reads beyond the end would go unseen.
Bytes joined(const std::vector<Bytes>& parts)
{
    Bytes result;
    for (const Bytes& part : parts)
        result += part;
    result.shrink_to_fit();
    return result;
}

// All records; that they and what was skipped make up the file is what the replay of the fuzzer's corpus
// checks.
std::vector<Found> recordsOf(const Bytes& dlf, std::size_t& skipped)
{
    DlfRecords records(dlf);
    std::vector<Found> result;
    while (const auto record = records.next())
        result.emplace_back(
            record->logType ? *record->logType : kNoType, Bytes(record->bytes.begin(), record->bytes.end()));
    skipped = records.skippedBytes();
    return result;
}

TEST(DlfRecords, AreFoundInEachForm)
{
    const Bytes a = dlfRecord(12, 1);
    const Bytes b = dlfRecord(40, 2);
    const auto typed = [](Bytes front, const Bytes& record) { return front += record; };
    const struct {
        const char* name;
        std::vector<Bytes> parts;
        std::vector<Found> records; // without the version report
    } cases[] = {
        {"clean", {a, b, a}, {{kNoType, a}, {kNoType, b}, {kNoType, a}}},
        {"clean, lengths that look like log types", {dlfRecord(257, 1), dlfRecord(511, 2), dlfRecord(255, 3)},
            {{kNoType, dlfRecord(257, 1)}, {kNoType, dlfRecord(511, 2)}, {kNoType, dlfRecord(255, 3)}}},
        {"intervals of one and of several messages",
            {versionReport(), a, b, typed({1}, b), typed({255}, a), b},
            {{kNoType, a}, {kNoType, b}, {1, b}, {255, a}, {kNoType, b}}},
        {"prefixes, the second byte of which looks like something",
            {versionReport(), a, typed({0x81, 0, 1}, b), typed({0x81, 1, 1}, a), typed({0x81, 0x81, 255}, b),
                typed({0x81, 255, 1}, a)},
            {{kNoType, a}, {1, b}, {1, a}, {255, b}, {1, a}}},
        {"intervals that begin within a prefix",
            {versionReport(), typed({7, 1}, a), typed({1, 255}, b), typed({0x81, 1}, a), typed({1}, b)},
            {{1, a}, {255, b}, {1, a}, {1, b}}},
        {"snapshot, lengths that look like log types",
            {versionReport(), dlfRecord(257, 1), typed({1}, dlfRecord(511, 2)), dlfRecord(255, 3),
                typed({255}, dlfRecord(513, 4))},
            {{kNoType, dlfRecord(257, 1)}, {1, dlfRecord(511, 2)}, {kNoType, dlfRecord(255, 3)},
                {255, dlfRecord(513, 4)}}},
        {"last payload that looks like records", {versionReport(), a, typed({1}, dlfRecord(1281, 2, 1))},
            {{kNoType, a}, {1, dlfRecord(1281, 2, 1)}}},
        {"payloads that look like records", {versionReport(), dlfRecord(257, 1, 1), dlfRecord(257, 2, 1)},
            {{kNoType, dlfRecord(257, 1, 1)}, {kNoType, dlfRecord(257, 2, 1)}}},
    };
    for (const auto& [name, parts, expected] : cases) {
        SCOPED_TRACE(name);
        std::size_t skipped = 0;
        auto records = recordsOf(joined(parts), skipped);
        if (parts.front() == versionReport())
            records.erase(records.begin());
        EXPECT_EQ(records, expected);
        EXPECT_EQ(skipped, 0U);
    }
}

TEST(DlfRecords, CutFileGivesWhatIsWhole)
{
    const Bytes whole = joined({versionReport(), dlfRecord(20, 0), {1}, dlfRecord(21, 1), {0x81, 0x22, 1},
        dlfRecord(22, 2), {1}, dlfRecord(23, 3), dlfRecord(24, 4), {0x81, 0x22, 1}, dlfRecord(25, 5)});
    std::size_t skipped = 0;
    const auto all = recordsOf(whole, skipped);
    ASSERT_EQ(all.size(), 7U);
    for (std::size_t length = whole.size(); length-- > 0;) {
        const auto some =
            recordsOf(Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)), skipped);
        ASSERT_LT(some.size(), all.size()) << length;
        EXPECT_TRUE(std::ranges::equal(some, std::span(all).first(some.size()))) << length;
    }
}

TEST(DlfRecords, AreFoundAgainBehindALengthThatLies)
{
    for (const std::uint8_t lie : Bytes{0, 1, 11, 255}) { // the last one leads beyond the end
        Bytes wrong = dlfRecord(30, 2);
        wrong[0] = lie;
        wrong[1] = lie == 255 ? 255 : 0;
        std::size_t skipped = 0;
        const Bytes dlf = joined({dlfRecord(40, 1), wrong, dlfRecord(20, 3), dlfRecord(25, 4)});
        EXPECT_THAT(recordsOf(dlf, skipped),
            testing::ElementsAre(Found{kNoType, dlfRecord(40, 1)}, Found{kNoType, dlfRecord(20, 3)},
                Found{kNoType, dlfRecord(25, 4)}))
            << int{lie};
        EXPECT_EQ(skipped, 30U);
    }
}

TEST(DlfRecords, AreToldFromOtherFiles)
{
    const Bytes near = dlfRecord(20, 1);
    Bytes far = near;
    far[11] = 0x80;
    const Bytes zeros(500);
    const struct {
        bool isDlf;
        std::vector<Bytes> parts;
    } cases[] = {
        {true, {near}},
        {true, {near, far}},
        {true, {far, near, near, zeros}},
        {true, {near, far, near, far}},
        {true, {versionReport(), zeros}},
        {false, {}},
        {false, {zeros}},
        {false, {near, zeros}},
        {false, {near, far, zeros}},
        {false, {Bytes(kMTLDLFVersionReportLength - 1, 161)}},
    };
    for (const auto& [isDlf, parts] : cases)
        EXPECT_EQ(DlfRecords(joined(parts)).beginsWithRecords(), isDlf) << &parts - &cases[0].parts;
}

TEST(DlfRecords, AnythingComesToAnEnd)
{
    constexpr std::size_t kLength = std::size_t{3} << 20;
    std::size_t skipped = 0;
    EXPECT_TRUE(recordsOf(Bytes(kLength, 0), skipped).empty());
    EXPECT_EQ(skipped, kLength);
    for (const std::uint8_t byte : Bytes{0x01, 0x0C, 0x81, 0xFF})
        EXPECT_FALSE(recordsOf(Bytes(kLength, byte), skipped).empty()) << int{byte};
}

// A prefix by the number of the message: -1 none, else the prefix's second byte.
int prefixOf(const std::string& kind, std::size_t number)
{
    if (kind == "none" || (kind == "now and then, any" && number % 3 != 0))
        return -1;
    if (kind == "zeros")
        return 0;
    return kind == "like a log type" ? (number % 2 == 0 ? 1 : 255) : static_cast<int>(number % 256);
}

TEST(DlfRecords, OfASnapshotGiveEveryMessageOfEveryCaptureBack)
{
    for (const char* technology : {"MRL_GSM", "MRL_CDMA", "MRL_LTE", "MRL_UTRAN2"}) {
        const std::vector<Bytes> drive = captureOf(technology);
        for (const char* kind : {"none", "zeros", "now and then, any", "like a log type"}) {
            std::vector<Bytes> messages;
            for (const Bytes& message : drive) {
                const int prefix = prefixOf(kind, messages.size());
                messages.push_back(prefix < 0 ? Bytes() : Bytes{0x81, static_cast<std::uint8_t>(prefix)});
                messages.back() += message;
            }
            for (const std::size_t perInterval : {1U, 2U, 7U, 60U}) {
                SCOPED_TRACE(
                    testing::Message() << technology << ", prefixes: " << kind << ", " << perInterval);
                const Bytes dlf = snapshotDlf(messages, perInterval);
                DlfRecords records(dlf);
                records.next(); // the version report
                for (std::size_t i = 0; i < messages.size(); ++i) {
                    const std::size_t prefix = prefixOf(kind, i) < 0 ? 0 : 2;
                    const bool losesType = i % perInterval == 0 && prefix == 0;
                    const auto record = records.next();
                    ASSERT_TRUE(record) << i;
                    ASSERT_TRUE(std::ranges::equal(record->bytes, std::span(messages[i]).subspan(prefix + 1)))
                        << i;
                    ASSERT_EQ(record->logType, losesType ? std::nullopt : std::optional(messages[i][prefix]))
                        << i;
                }
                EXPECT_FALSE(records.next());
                EXPECT_EQ(records.skippedBytes(), 0U);
            }
        }
    }
}

} // namespace
} // namespace orvex
