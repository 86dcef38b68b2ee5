// Every scenario, through the receiver's own decoders.

#include "Decoding.h"
#include "ScenarioItems.h"
#include "TextFormat.h"

#include <set>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

// The paths of rows without a value and of lists without a record.
void collectUnset(const Value& value, const std::string& path, std::set<std::string>& unset)
{
    if (const auto dictionary = value.dictionary()) {
        for (const auto& [key, element] : *dictionary)
            collectUnset(element, text("%s/%s", path.c_str(), key.c_str()), unset);
    } else if (test::Decoding::isUnset(test::textOf(value))) {
        unset.insert(path);
    }
}

TEST(EveryScenario, BringsEverySectionToLifeWithinAMinute)
{
    // Sections that are never filled.
    const std::map<std::string, std::set<std::string>> silent = {
        {"MRL_GSM", {"/Neighbors/Detected Set", "/Neighbors/Monitored Set", "/Neighbors/Virtual Active Set"}},
        {"MRL_UTRAN2", {"/GSM Neighbor Cell List"}},
    };
    for (const ScenarioEntry& entry : scenarioTable()) {
        test::Decoding decoding(entry.technology);
        std::set<std::string> unset;
        bool isFirst = true;
        for (const auto& [due, message] : itemsOf(entry, 60s)) {
            decoding.feed(message.bytes);
            std::set<std::string> now;
            collectUnset(decoding.display(), "", now);
            // What was once alive may be empty again.
            if (isFirst)
                unset = now;
            isFirst = false;
            std::erase_if(unset, [&now](const std::string& path) { return !now.contains(path); });
        }
        const auto expected = silent.find(entry.technology);
        EXPECT_EQ(unset, expected == silent.end() ? std::set<std::string>() : expected->second)
            << entry.technology;
    }
}

} // namespace
} // namespace orvex::korat
