// From ModemManager's cells to what a monitor shows of them.

#include "modem/LteBand.h"
#include "modem/ModemManagerCells.h"

#include "ModemDisplay.h"

#include <gtest/gtest.h>

#include <limits>

namespace orvex::korat {
namespace {

// Real answers of ModemManager 1.20 to GetCellInfo, where not said otherwise.
DictionaryRef gsmServing()
{
    return Dictionary::make({{"cell-type", 2}, {"serving", true}, {"operator-id", "00101"}, {"lac", "1234"},
        {"ci", "2BAF"}, {"arfcn", 71}, {"base-station-id", "21"}, {"rx-level", 40}, {"timing-advance", 2}});
}
DictionaryRef gsmNeighbor()
{
    return Dictionary::make({{"cell-type", 2}, {"serving", false}, {"arfcn", 75}, {"rx-level", 31}});
}
DictionaryRef umtsServing()
{
    return Dictionary::make({{"cell-type", 3}, {"serving", true}, {"operator-id", "310410"}, {"lac", "1234"},
        {"ci", "D30156"}, {"uarfcn", 10564}, {"psc", 296}, {"rscp", -79.0}, {"ecio", -7.0}});
}
DictionaryRef umtsNeighbor()
{
    return Dictionary::make({{"cell-type", 3}, {"serving", false}, {"uarfcn", 10589}, {"psc", 17},
        {"rscp", -98.6}, {"ecio", -14.5}});
}
DictionaryRef tdscdmaServing()
{
    return Dictionary::make({{"cell-type", 4}, {"serving", true}, {"operator-id", "00101"}, {"lac", "1234"},
        {"ci", "D30157"}, {"uarfcn", 10055}, {"cell-parameter-id", 77}, {"timing-advance", 4},
        {"rscp", -85.0}, {"path-loss", 100}});
}
DictionaryRef lteServing()
{
    return Dictionary::make({{"cell-type", 5}, {"serving", true}, {"operator-id", "00101"}, {"tac", "84CD"},
        {"ci", "1A2D001"}, {"physical-ci", "12D"}, {"earfcn", 6300}, {"rsrp", -94.0}, {"rsrq", -11.0},
        {"timing-advance", 3}});
}
DictionaryRef lteNeighbor()
{
    return Dictionary::make({{"cell-type", 5}, {"serving", false}, {"physical-ci", "12E"}, {"earfcn", 6300},
        {"rsrp", -101.0}, {"rsrq", -14.0}});
}
DictionaryRef nr5gServing() // as version 1.22 answers
{
    return Dictionary::make({{"cell-type", 6}, {"serving", true}, {"operator-id", "00101"}, {"tac", "1ABCDE"},
        {"ci", "F12345678"}, {"physical-ci", "3EF"}, {"nrarfcn", 632448}, {"rsrp", -88.5}, {"sinr", 12.5},
        {"bandwidth", 100}});
}
DictionaryRef cdmaServing()
{
    return Dictionary::make({{"cell-type", 1}, {"serving", true}, {"sid", "1F"}, {"nid", "2A"},
        {"base-station-id", "3B"}, {"ref-pn", "C8"}, {"pilot-strength", 14}});
}

ModemState stateWith(const ArrayRef& cells)
{
    ModemState state;
    state.condition = Condition::enabled;
    state.cellAnswer = CellAnswer::told;
    takeCells(state, cells);
    return state;
}

TEST(ModemCells, AreShownByEachTechnology)
{
    const struct {
        const char* name;
        const char* technology;
        ArrayRef cells;
        const char* shownIn;
        const char* expected;
        bool withMeasurements = false;
    } cases[] = {
        {"GSM cell", "IFX", Array::make({gsmServing()}), "Serving Cell",
            "{Technology=GSM, Network=001-01, LAC=4660, Cell ID=11183, ARFCN=71, Timing Advance=2, BSIC=4-1, "
            "RxLev=-71 dBm}"},
        {"UMTS cell", "IFX", Array::make({umtsServing()}), "Serving Cell",
            "{Technology=UMTS, Network=310-410, LAC=4660, Cell ID=13828438, UARFCN=10564, Scrambling "
            "Code=296, "
            "RSCP=-79.0 dBm, Ec/Io=-7.0 dB}"},
        {"TD-SCDMA cell", "IFX", Array::make({tdscdmaServing()}), "Serving Cell",
            "{Technology=TD-SCDMA, Network=001-01, LAC=4660, Cell ID=13828439, UARFCN=10055, "
            "Cell Parameter ID=77, Timing Advance=4, RSCP=-85.0 dBm, Path Loss=100 dB}"},
        {"LTE cell", "IFX", Array::make({lteServing()}), "Serving Cell",
            "{Technology=LTE, Network=001-01, TAC=33997, Cell ID=27447297, Physical Cell ID=301, "
            "EARFCN=6300, "
            "Timing Advance=3, Band=20, RSRP=-94.0 dBm, RSRQ=-11.0 dB}"},
        {"5G cell, with an entry nobody knows yet", "IFX", Array::make({nr5gServing()}), "Serving Cell",
            "{Technology=5G, Network=001-01, TAC=1752286, Cell ID=64729929336, Physical Cell ID=1007, "
            "NR-ARFCN=632448, RSRP=-88.5 dBm, SINR=12.5 dB, bandwidth=100}"},
        {"CDMA cell", "IFX", Array::make({cdmaServing()}), "Serving Cell",
            "{Technology=CDMA, System ID=31, Network ID=42, Base Station ID=59, PN Offset=200, "
            "Pilot Strength=14}"},
        {"5G beside LTE", "IFX", Array::make({nr5gServing(), lteServing()}), "Serving 5G Cell",
            "{Technology=5G, Network=001-01, TAC=1752286, Cell ID=64729929336, Physical Cell ID=1007, "
            "NR-ARFCN=632448, RSRP=-88.5 dBm, SINR=12.5 dB, bandwidth=100}"},
        {"each neighbour once", "IFX", Array::make({lteNeighbor(), lteServing(), lteNeighbor()}),
            "LTE Neighbors", "[Physical Cell ID=302, EARFCN=6300, Band=20, RSRP=-101.0 dBm, RSRQ=-14.0 dB]"},
        {"a single row keeps its name", "IFX",
            Array::make({Dictionary::make({{"cell-type", 3}, {"psc", 17}})}), "UMTS Neighbors",
            "[Scrambling Code: 17]"},

        {"GSM cell", "MRL_GSM", Array::make({gsmServing()}), "GSM Serving Cell",
            "{Cell ID=11183, ARFCN=71, BSIC=33}"},
        {"GSM network", "MRL_GSM", Array::make({gsmServing()}), "Serving PLMN",
            "{Mobile Country Code=1, Mobile Network Code=1, Location Area Code=4660}"},
        {"GSM neighbour", "MRL_GSM", Array::make({gsmServing(), gsmNeighbor()}), "Neighboring Cells",
            "[ARFCN=75, RSSI=-80 dBm]"},
        {"UMTS cell", "MRL_GSM", Array::make({umtsServing()}), "UMTS RR Info",
            "{Cell ID=13828438, Scrambling Code=296, UARFCN=10564}"},
        {"UMTS neighbour", "MRL_GSM", Array::make({umtsServing(), umtsNeighbor()}), "UMTS Set",
            "[UARFCN=10589, Scrambling Code=17, RSCP=-99 dBm, Energy Per Chip=-15 dB]"},
        {"TD-SCDMA cell", "MRL_UTRAN2", Array::make({tdscdmaServing()}), "Serving Cell Info",
            "{Cell ID=13828439, Cell Scrambling Code=77, Local Area Code=4660, Downlink UARFCN=10055, "
            "Uplink UARFCN=10055}"},
        {"LTE cell", "MRL_LTE", Array::make({lteServing()}), "Serving Cell Info",
            "{Physical Cell ID=301, Cell Identity=27447297, Tracking Area Code=33997, Freq Band "
            "Indicator=20, "
            "UARFCN=6300}"},
        {"LTE measurement, not asked for", "MRL_LTE", Array::make({lteServing(), lteNeighbor()}),
            "Measured Neighbor Cells", "[]"},
        {"LTE measurement", "MRL_LTE", Array::make({lteServing(), lteNeighbor()}),
            "Connected mode LTE Intra-frequency Measurement",
            "{Serving Physical Cell ID=301, Serving Filtered RSRP=-94.00 dBm, Serving Filtered RSRQ=-11.00 "
            "dB, "
            "E-ARFCN=6300, Subframe Number=0}",
            true},
        {"LTE neighbour's measurement", "MRL_LTE", Array::make({lteServing(), lteNeighbor()}),
            "Measured Neighbor Cells",
            "[Physical Cell ID=302, Filtered RSRP=-101.00 dBm, Filtered RSRQ=-14.00 dB]", true},
    };
    for (const auto& [name, technology, cells, shownIn, expected, withMeasurements] : cases) {
        const Value shown = section(display(technology, stateWith(cells), withMeasurements), shownIn);
        EXPECT_EQ(test::shown(shown), expected) << technology << ": " << name;
    }
}

TEST(ModemCells, WhatIsNoValueIsLeftOut)
{
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double unknown = -std::numeric_limits<double>::max(); // MM_SIGNAL_UNKNOWN
    const struct {
        const char* name;
        const char* key;
        Value value;
        const char* technology;
        const char* shownIn;
        const char* missing;
    } cases[] = {
        {"no hexadecimal", "tac", "84CG", "IFX", "Serving Cell", "TAC"},
        {"negative", "tac", "-1", "IFX", "Serving Cell", "TAC"},
        {"empty", "ci", "", "IFX", "Serving Cell", "Cell ID"},
        {"35 bits too many", "ci", "FFFFFFFFFFFFFFFF", "IFX", "Serving Cell", "Cell ID"},
        {"a cell identity of 5G", "ci", "FFFFFFFFF", "MRL_LTE", "Serving Cell Info", "Cell Identity"},
        {"a level that is no number", "rsrp", nan, "IFX", "Serving Cell", "RSRP"},
        {"a level that was not measured", "rsrq", unknown, "IFX", "Serving Cell", "RSRQ"},
        {"a level of another kind", "rsrp", "-94", "IFX", "Serving Cell", "RSRP"},
        {"a short operator identifier", "operator-id", "001", "MRL_LTE", "Serving Cell Info", "MCC"},
        {"an operator identifier of letters", "operator-id", "001x1", "MRL_GSM", "Serving PLMN", "MCC"},
        {"no band", "earfcn", 10400, "MRL_LTE", "Serving Cell Info", "Freq Band Indicator"},
    };
    for (const auto& [name, key, value, technology, shownIn, missing] : cases) {
        const DictionaryRef cell = lteServing();
        cell->set(key, value);
        for (const bool withMeasurements : {false, true}) {
            const Value shown =
                section(display(technology, stateWith(Array::make({cell})), withMeasurements), shownIn);
            ASSERT_TRUE(shown.dictionary()) << name;
            EXPECT_FALSE(shown.dictionary()->contains(missing)) << name << ": " << test::shown(shown);
        }
    }
    const auto others = Array::make({7, "cell", Dictionary::make(), Dictionary::make({{"cell-type", 99}}),
        Dictionary::make({{"cell-type", "5"}, {"serving", 1}})});
    EXPECT_TRUE(stateWith(others).cells.empty());
}

TEST(ModemCells, AThousandFitIntoOneMessage)
{
    auto cells = Array::make({lteServing()});
    for (int i = 0; i < 1000; ++i) {
        const DictionaryRef cell = umtsNeighbor();
        cell->set("uarfcn", 10000 + i);
        cells->append(cell);
    }
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
