// From ModemManager's cells to what a monitor shows of them.

#include "modem/LteBand.h"
#include "modem/ModemManagerCells.h"

#include "CaseLines.h"
#include "ModemDisplay.h"

#include <gtest/gtest.h>

#include <limits>
#include <map>
#include <tuple>

namespace orvex::korat {
namespace {

// A cell by its name in cells.txt, with other entries in place of those that follow it, or these alone.
DictionaryRef cellOf(const std::map<std::string, Json>& named, const std::string& words)
{
    const auto brace = std::min(words.find('{'), words.size());
    const std::string name = words.substr(0, words.find(' '));
    Json cell = brace == 0 ? Json::object() : named.at(name);
    if (brace < words.size())
        cell.merge_patch(Json::parse(words.substr(brace)));
    return valueOf(cell).dictionary();
}

ModemState stateWith(const ArrayRef& cells)
{
    ModemState state;
    state.condition = Condition::enabled;
    state.cellAnswer = CellAnswer::told;
    takeCells(state, cells);
    return state;
}

// Lines of cells.txt: "NAME = JSON" is a cell, and "CELL + CELL | TECHNOLOGY | SECTION -> SHOWN" what the
// monitor shows there. ", measured" after the technology: also as measurements.
TEST(ModemCells, AreShownByEachTechnology)
{
    std::map<std::string, Json> named;
    for (const std::string& line : test::caseLines("tools/modem/cells.txt")) {
        SCOPED_TRACE(line);
        const auto [definition, shown] = test::divided(line, " -> ");
        if (shown.empty()) {
            const auto [name, json] = test::divided(line, " = ");
            named[name] = Json::parse(json);
            continue;
        }
        const auto [words, place] = test::divided(definition, " | ");
        const auto [technology, name] = test::divided(place, " | ");
        const auto cells = Array::make();
        for (auto [cell, others] = test::divided(words, " + "); !cell.empty();
             std::tie(cell, others) = test::divided(others, " + "))
            cells->append(cellOf(named, cell));
        const auto [monitor, measured] = test::divided(technology, ", ");
        const Value whole = display(monitor.c_str(), stateWith(cells), !measured.empty());
        EXPECT_EQ(test::shown(section(whole, name.c_str())), shown);
    }
    const auto cell = cellOf(named, "lte");
    cell->set("rsrp", std::numeric_limits<double>::quiet_NaN());
    EXPECT_TRUE(stateWith(Array::make({7, "cell", cell})).cells.at(0).rsrp == std::nullopt);
}

TEST(ModemCells, AThousandFitIntoOneMessage)
{
    const auto cells = Array::make({Dictionary::make({{"cell-type", 5}, {"serving", true}})});
    for (int i = 0; i < 1000; ++i)
        cells->append(Dictionary::make({{"cell-type", 3}, {"serving", false}, {"uarfcn", 10000 + i},
            {"psc", 17}, {"rscp", -98.6}, {"ecio", -14.5}}));
    const ModemState state = stateWith(cells);
    EXPECT_EQ(state.cells.size(), 256U);
    const Value report = display("IFX", state);
    EXPECT_EQ((*report.dictionary())["UMTS Neighbors"].array()->size(), 255U);
    EXPECT_EQ(test::shown(section(report, "Cells")), "745 more cells than are shown");
    for (const char* technology : {"IFX", "MRL_GSM"}) {
        for (const Content& content : contentsFor(technology, state, true))
            EXPECT_LT(messageOf(content, 1).size(), 262'144U)
                << technology; // a recording takes no longer one
    }
}

// First and last EARFCN of a band, and those beside it that have none or another one.
TEST(LteBand, IsThatOfTheTable)
{
    const std::pair<int, std::optional<int>> cases[] = {{0, 1}, {599, 1}, {600, 2}, {4949, 11}, {4950, {}},
        {5009, {}}, {5010, 12}, {6150, 20}, {6449, 20}, {10359, 32}, {10360, {}}, {35999, {}}, {36000, 33},
        {60254, 53}, {65536, 65}, {70645, 88}, {70646, {}}, {-1, {}}};
    for (const auto& [earfcn, band] : cases)
        EXPECT_EQ(lteBandOf(earfcn), band) << earfcn;
}

} // namespace
} // namespace orvex::korat
