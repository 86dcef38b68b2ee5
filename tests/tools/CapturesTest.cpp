// What the captures in captures/ show: everything that the screens can.

#include "Captures.h"
#include "FixedClock.h"

#include "Array.h"
#include "FileStorage.h"
#include "LogGenerator.h"
#include "SystemLog.h"

#include <gtest/gtest.h>

#include <map>
#include <set>

namespace orvex::test {
namespace {

// Lists that nothing the technology can send fills.
const std::pair<const char*, std::set<std::string>> kEmpty[] = {
    {"MRL_GSM",
        {"/Neighbors/Cell Change Counters", "/Neighbors/Detected Set", "/Neighbors/Monitored Set",
            "/Neighbors/Non-Ranked GSM Set", "/Neighbors/Non-Ranked UMTS Set",
            "/Neighbors/Virtual Active Set", "/Packet Data/Coding Scheme", "/Serving/UMTS RR Measurement"}},
    {"MRL_CDMA", {}},
    {"MRL_LTE", {}},
    {"MRL_UTRAN2", {"/GSM Neighbor Cell List"}},
    {"IFX", {}},
};

// By path: sections, groups and rows, and whether a capture has filled them.
using Filled = std::map<std::string, bool>;

void note(Filled& filled, const std::string& path, const Value& shown)
{
    bool& isFilled = filled[path];
    if (const auto rows = shown.dictionary()) {
        isFilled = isFilled || !rows->isEmpty();
        for (const auto& [row, value] : *rows) // those of pilots are numbered
            note(filled, path + "/" + (row.find(';') == std::string::npos ? row : "Pilot"), value);
    } else if (const auto list = shown.array()) {
        isFilled = isFilled || !list->isEmpty();
        for (const Value& record : *list)
            note(filled, path, record);
    } else {
        ASSERT_TRUE(shown.string()) << path;
        isFilled = isFilled || (*shown.string() != "" && *shown.string() != "—");
    }
}

TEST(Captures, FillEverySectionEveryRowAndEveryList)
{
    installConsole([](std::string_view) {}); // some sections write a line for every packet
    const FileResources resources(ORVEX_RESOURCES);
    const FixedClock clock;
    for (const auto& [technology, empty] : kEmpty) {
        const auto generator =
            LogGenerator::generatorFromTechnology(technology, {resources, clock, std::nullopt});
        const DictionaryRef state = Dictionary::make();
        Filled filled;
        for (const Bytes& message : captureOf(technology)) {
            generator->updateState(*state, message);
            note(filled, "", (*state)["Display"]);
        }
        std::erase_if(filled, [](const auto& each) { return each.second; });
        std::set<std::string> neverFilled;
        for (const auto& [path, isFilled] : filled)
            neverFilled.insert(path);
        EXPECT_EQ(neverFilled, empty) << technology;
    }
}

} // namespace
} // namespace orvex::test
