// How a modem's state becomes a stream in time.

#include "modem/ModemSource.h"
#include "modem/TechnologyChoice.h"

#include <gtest/gtest.h>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

Cell servingCell(Radio radio, int identity = 1)
{
    Cell cell;
    cell.radio = radio;
    cell.isServing = true;
    cell.identity = identity;
    return cell;
}

ModemState stateOn(Radio radio)
{
    ModemState state;
    state.condition = Condition::enabled;
    state.cellAnswer = CellAnswer::told;
    state.cells = {servingCell(radio)};
    return state;
}

TEST(TechnologyChoice, FollowsTheServingCellAfterItHasSettled)
{
    TechnologyChoice choice;
    const TechnologyChoice::Time start{};
    ModemState nothing;
    EXPECT_EQ(choice.choose(nothing), "IFX");
    EXPECT_EQ(choice.choose(stateOn(Radio::lte)), "MRL_LTE"); // a monitor asks: at once
    ModemState silent = stateOn(Radio::lte);
    silent.cells.clear();
    const std::tuple<std::chrono::seconds, ModemState, const char*> steps[] = {
        {0s, stateOn(Radio::gsm), "MRL_LTE"},
        {9s, stateOn(Radio::umts), "MRL_LTE"}, // shown by the same technology
        {10s, stateOn(Radio::gsm), "MRL_GSM"},
        {11s, stateOn(Radio::tdscdma), "MRL_GSM"},
        {20s, stateOn(Radio::umts), "MRL_GSM"}, // back in time
        {21s, stateOn(Radio::tdscdma), "MRL_GSM"},
        {30s, stateOn(Radio::tdscdma), "MRL_GSM"},
        {31s, stateOn(Radio::tdscdma), "MRL_UTRAN2"},
        {32s, silent, "MRL_UTRAN2"}, // no coverage: nothing speaks for another
        {90s, nothing, "MRL_UTRAN2"},
        {91s, stateOn(Radio::nr5g), "MRL_UTRAN2"},
        {101s, stateOn(Radio::nr5g), "IFX"},
    };
    for (const auto& [time, state, technology] : steps)
        EXPECT_EQ(choice.follow(state, start + time), technology) << time.count();
}

TEST(TechnologyChoice, GoesByTheAccessTechnologyUntilCellsAreAnsweredFor)
{
    const std::tuple<const char*, CellAnswer, std::optional<Radio>, const char*> cases[] = {
        {"not asked yet", CellAnswer::notAsked, Radio::lte, "MRL_LTE"},
        {"not asked, not registered", CellAnswer::notAsked, std::nullopt, "IFX"},
        {"cells are not told", CellAnswer::notSupported, Radio::lte, "IFX"},
        {"cells may not be asked for", CellAnswer::denied, Radio::lte, "IFX"},
    };
    for (const auto& [name, answer, radio, technology] : cases) {
        ModemState state = stateOn(Radio::gsm);
        state.cells.clear();
        state.cellAnswer = answer;
        state.radio = radio;
        EXPECT_EQ(TechnologyChoice().choose(state), technology) << name;
    }
}

struct FakeReader final : ModemReader {
    std::string start() override { return {}; }
    void setAsking(bool) override { }
    const ModemState& state() const override { return current; }
    std::uint64_t version() const override { return changes; }

    ModemState current = stateOn(Radio::lte);
    std::uint64_t changes = 0;
};

TEST(ModemSource, SendsWhatHasChangedAndEverythingAgainAfterHalfAMinute)
{
    FakeReader reader;
    ModemSource source(reader, "MRL_LTE", false);
    const auto codesAt = [&](std::chrono::seconds now) {
        std::vector<LogCode> codes;
        while (const auto message = source.next(now)) {
            codes.push_back(message->code.value_or(0));
            EXPECT_EQ(message->due, now);
        }
        return codes;
    };
    const std::vector<LogCode> all{kExtraCodeSimFiles, kExtraCodeCellMonitorList, kExtraCodePDPContexts};
    EXPECT_EQ(codesAt(0s), all);
    ++reader.changes; // to the same state
    EXPECT_TRUE(codesAt(5s).empty());
    reader.current.cells[0] = servingCell(Radio::lte, 2);
    ++reader.changes;
    EXPECT_EQ(codesAt(10s), std::vector<LogCode>{kExtraCodeCellMonitorList});
    EXPECT_TRUE(codesAt(29s).empty());
    EXPECT_EQ(codesAt(30s), (std::vector<LogCode>{kExtraCodeSimFiles, kExtraCodePDPContexts}));
    EXPECT_EQ(codesAt(40s), std::vector<LogCode>{kExtraCodeCellMonitorList});
    reader.current.bearers.emplace_back();
    reader.current.cells.clear();
    ++reader.changes;
    EXPECT_EQ(codesAt(41s), (std::vector<LogCode>{kExtraCodeCellMonitorList, kExtraCodePDPContexts}));
}

} // namespace
} // namespace orvex::korat
