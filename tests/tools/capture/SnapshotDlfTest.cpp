// The DLF that a snapshot has of every scenario, read again.

#include "DlfBytes.h"
#include "DlfRecords.h"
#include "ScenarioItems.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

// Prefixes by the number of the message: -1 none, else the prefix's second byte.
using PrefixOf = int (*)(std::size_t number);

std::vector<Bytes> messagesOf(const korat::ScenarioEntry& entry, PrefixOf prefixOf)
{
    std::vector<Bytes> result;
    for (const auto& [due, message] : itemsOf(entry, 60s)) {
        const int prefix = prefixOf(result.size());
        result.push_back(prefix < 0 ? Bytes() : Bytes{0x81, static_cast<std::uint8_t>(prefix)});
        result.back() += message.bytes;
    }
    return result;
}

TEST(SnapshotDlf, GivesEveryMessageOfEveryScenarioBack)
{
    const struct {
        const char* name;
        PrefixOf prefixOf;
    } prefixes[] = {
        {"none", [](std::size_t) { return -1; }},
        {"zeros", [](std::size_t) { return 0; }},
        {"now and then, any",
            [](std::size_t number) { return number % 3 == 0 ? static_cast<int>(number % 256) : -1; }},
        {"like a log type", [](std::size_t number) { return number % 2 == 0 ? 1 : 255; }},
    };
    for (const korat::ScenarioEntry& entry : korat::scenarioTable()) {
        if (entry.make({})->codes().empty())
            continue; // no packets, so no DLF
        for (const auto& [name, prefixOf] : prefixes) {
            for (const std::size_t perInterval : {1U, 2U, 7U, 60U}) {
                SCOPED_TRACE(testing::Message()
                    << entry.technology << ", prefixes: " << name << ", intervals of " << perInterval);
                const std::vector<Bytes> messages = messagesOf(entry, prefixOf);
                ASSERT_GT(messages.size(), 200U);
                const Bytes dlf = snapshotDlf(messages, perInterval);
                DlfRecords records(dlf);
                records.next(); // the version report
                for (std::size_t i = 0; i < messages.size(); ++i) {
                    const std::size_t prefix = prefixOf(i) < 0 ? 0 : 2;
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
} // namespace orvex::test
