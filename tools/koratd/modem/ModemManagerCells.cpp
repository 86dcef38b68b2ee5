#include "modem/ModemManagerCells.h"

#include "Array.h"
#include "Dictionary.h"
#include "TextFormat.h"
#include "VisibleText.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <span>

namespace orvex::korat {

namespace {
constexpr std::size_t kMostCells = 256;
constexpr std::size_t kMostOthers = 16;
constexpr std::size_t kLongestText = 200;
constexpr double kLargestLevel = 1000;        // dB; nothing is as loud, or as faint
constexpr const char* kNetworkLocation = "1"; // MM_MODEM_LOCATION_SOURCE_3GPP_LAC_CI

struct NumberKey {
    const char* key;
    Cell::Number Cell::*field;
    std::int64_t most;
};
struct LevelKey {
    const char* key;
    Cell::Level Cell::*field;
};

// Which key means what depends on the technology: "base-station-id" is a BSIC in GSM.
constexpr NumberKey kGsmNumbers[] = {
    {"lac", &Cell::areaCode, 0xFFFF},
    {"ci", &Cell::identity, 0xFFFF},
    {"base-station-id", &Cell::physicalIdentity, 63},
    {"arfcn", &Cell::channel, 1023},
    {"rx-level", &Cell::receiveLevel, 63},
    {"timing-advance", &Cell::timingAdvance, 0xFFFF},
};
constexpr NumberKey kUmtsNumbers[] = {
    {"lac", &Cell::areaCode, 0xFFFF},
    {"ci", &Cell::identity, 0xFFFFFFF},
    {"psc", &Cell::physicalIdentity, 511},
    {"uarfcn", &Cell::channel, 16383},
    {"path-loss", &Cell::pathLoss, 0xFFFF},
};
constexpr NumberKey kTdscdmaNumbers[] = {
    {"lac", &Cell::areaCode, 0xFFFF},
    {"ci", &Cell::identity, 0xFFFFFFF},
    {"cell-parameter-id", &Cell::physicalIdentity, 127},
    {"uarfcn", &Cell::channel, 16383},
    {"timing-advance", &Cell::timingAdvance, 0xFFFF},
    {"path-loss", &Cell::pathLoss, 0xFFFF},
};
constexpr NumberKey kCdmaNumbers[] = {
    {"sid", &Cell::systemId, 0x7FFF},
    {"nid", &Cell::networkId, 0xFFFF},
    {"base-station-id", &Cell::identity, 0xFFFF},
    {"ref-pn", &Cell::physicalIdentity, 511},
    {"pilot-strength", &Cell::pilotStrength, 0xFFFF},
};
constexpr NumberKey kLteNumbers[] = {
    {"tac", &Cell::areaCode, 0xFFFF},
    {"ci", &Cell::identity, 0xFFFFFFF},
    {"physical-ci", &Cell::physicalIdentity, 503},
    {"earfcn", &Cell::channel, 262143},
    {"timing-advance", &Cell::timingAdvance, 0xFFFF},
};
constexpr NumberKey kNr5gNumbers[] = {
    {"tac", &Cell::areaCode, 0xFFFFFF},
    {"ci", &Cell::identity, 0xFFFFFFFFF},
    {"physical-ci", &Cell::physicalIdentity, 1007},
    {"nrarfcn", &Cell::channel, 3279165},
    {"timing-advance", &Cell::timingAdvance, 0xFFFF},
};
constexpr LevelKey kLevels[] = {
    {"rsrp", &Cell::rsrp},
    {"rsrq", &Cell::rsrq},
    {"sinr", &Cell::sinr},
    {"rscp", &Cell::rscp},
    {"ecio", &Cell::ecio},
};

// MMCellType.
constexpr struct {
    std::int64_t type;
    Radio radio;
    std::span<const NumberKey> numbers;
} kCellTypes[] = {
    {1, Radio::cdma, kCdmaNumbers},
    {2, Radio::gsm, kGsmNumbers},
    {3, Radio::umts, kUmtsNumbers},
    {4, Radio::tdscdma, kTdscdmaNumbers},
    {5, Radio::lte, kLteNumbers},
    {6, Radio::nr5g, kNr5gNumbers},
};

bool isLevelKey(const std::string& key)
{
    return std::ranges::any_of(kLevels, [&](const LevelKey& each) { return key == each.key; });
}

// An entry that has no field of its own.
void takeOther(Cell& cell, const Dictionary::Entry& entry)
{
    std::string shown = textIn(entry.value);
    if (const auto* number = entry.value.integer())
        shown = std::to_string(*number);
    else if (const auto level = levelIn(entry.value))
        shown = text("%g", *level);
    if (!shown.empty() && cell.others.size() < kMostOthers)
        cell.others.emplace_back(textIn(entry.key), std::move(shown));
}

std::optional<Cell> cellFrom(const Dictionary& entries)
{
    const std::int64_t* type = entries["cell-type"].integer();
    const auto kind =
        std::ranges::find_if(kCellTypes, [&](const auto& each) { return type && each.type == *type; });
    if (kind == std::end(kCellTypes))
        return std::nullopt;
    Cell cell;
    cell.radio = kind->radio;
    const bool* serving = entries["serving"].boolean();
    cell.isServing = serving && *serving;
    cell.operatorId = textIn(entries["operator-id"]);
    for (const NumberKey& number : kind->numbers)
        cell.*number.field = numberIn(entries[number.key], number.most);
    for (const LevelKey& level : kLevels)
        cell.*level.field = levelIn(entries[level.key]);
    for (const Dictionary::Entry& entry : entries) {
        const bool isKnown = entry.key == "cell-type" || entry.key == "serving" || entry.key == "operator-id"
            || isLevelKey(entry.key) || std::ranges::any_of(kind->numbers, [&](const auto& number) {
                   return entry.key == number.key;
               });
        if (!isKnown)
            takeOther(cell, entry);
    }
    return cell;
}
} // namespace

std::string textIn(const Value& value)
{
    const std::string* string = value.string();
    return string ? visibleText(*string, kLongestText) : std::string();
}

std::optional<std::int64_t> numberIn(const Value& value, std::int64_t most)
{
    std::int64_t number = -1;
    if (const std::int64_t* integer = value.integer()) {
        number = *integer;
    } else if (const std::string* hexadecimal = value.string()) {
        const char* const end = hexadecimal->data() + hexadecimal->size();
        const auto [stop, error] = std::from_chars(hexadecimal->data(), end, number, 16);
        if (error != std::errc() || stop != end)
            return std::nullopt;
    }
    return number >= 0 && number <= most ? std::optional(number) : std::nullopt;
}

std::optional<double> levelIn(const Value& value)
{
    const double* level = value.real();
    return level && std::abs(*level) <= kLargestLevel ? std::optional(*level)
                                                      : std::nullopt; // NaN is neither
}

void takeCells(ModemState& state, const Value& answer)
{
    state.cells.clear();
    state.cellsLeftOut = 0;
    const ArrayRef list = answer.array();
    if (!list)
        return;
    for (const Value& element : *list) {
        const DictionaryRef entries = element.dictionary();
        auto cell = entries ? cellFrom(*entries) : std::nullopt;
        if (!cell || std::ranges::find(state.cells, *cell) != state.cells.end())
            continue;
        if (state.cells.size() < kMostCells)
            state.cells.push_back(*std::move(cell));
        else
            ++state.cellsLeftOut;
    }
}

// "MCC,MNC,LAC,CI,TAC", the last three hexadecimal; 0 stands for one that the technology does not have.
std::optional<Location> locationIn(const Value& answer)
{
    const DictionaryRef sources = answer.dictionary();
    const std::string* location = sources ? (*sources)[kNetworkLocation].string() : nullptr;
    if (!location)
        return std::nullopt;
    std::vector<std::string> fields{""};
    for (const char character : *location) {
        if (character == ',')
            fields.emplace_back();
        else
            fields.back() += character;
    }
    constexpr std::size_t kFields = 5;
    if (fields.size() != kFields)
        return std::nullopt;
    const auto numberOf = [](const std::string& field, std::int64_t most) {
        const auto number = numberIn(field, most);
        return number && *number != 0 ? number : std::nullopt;
    };
    const Location result{textIn(fields[0] + fields[1]), numberOf(fields[2], 0xFFFF),
        numberOf(fields[4], 0xFFFFFF), numberOf(fields[3], 0xFFFFFFFFF)};
    return result.cell || result.locationArea || result.trackingArea ? std::optional(result) : std::nullopt;
}

} // namespace orvex::korat
