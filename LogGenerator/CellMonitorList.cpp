#include "CellMonitorList.h"

#include "ExtraPackets.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace orvex {

namespace {

constexpr std::int16_t kNotMeasured = 32767;

void printLevel(RowWriter& row, const char* name, std::int32_t number, int unitsPerStep, const char* unit)
{
    const auto steps = static_cast<std::int16_t>(number);
    if (steps == kNotMeasured)
        row.setText(name, "");
    else
        row.setText(name, "%d%s", steps * unitsPerStep, unit);
}

void printNumber(RowWriter& row, const char* name, const CellEntry& entry, std::int32_t number)
{
    switch (entry.form) {
    case CellNumber::whole: row.setText(name, "%d", number); break;
    case CellNumber::low16Bits: row.setText(name, "%d", static_cast<std::uint16_t>(number)); break;
    case CellNumber::level: printLevel(row, name, number, 1, entry.unit); break;
    case CellNumber::levelBy2: printLevel(row, name, number, 2, entry.unit); break;
    }
}

} // namespace

bool CellRecord::is(const char* radioAccessTechnology, const char* cellType) const
{
    const std::string* radio = (*_record)[telephony::kCellRadioAccessTechnology].string();
    const std::string* type = (*_record)[telephony::kCellType].string();
    return radio && type && *radio == radioAccessTechnology && *type == cellType;
}

std::optional<std::int32_t> CellRecord::number(const char* key) const
{
    const std::int64_t* entry = (*_record)[key].integer();
    if (!entry || !std::in_range<std::int32_t>(*entry))
        return std::nullopt;
    return static_cast<std::int32_t>(*entry);
}

void printCell(
    RowWriter& row, const CellRecord& cell, std::span<const CellEntry> entries, const char* sectionInMessage)
{
    for (const CellEntry& entry : entries) {
        const auto number = cell.number(entry.key);
        if (!number) {
            systemLog(Priority::error, "%s: Failed to retrieve %s\n", sectionInMessage, entry.nameInMessage);
            continue;
        }
        printNumber(row, entry.row, entry, *number);
        if (entry.otherRow)
            printNumber(row, entry.otherRow, entry, *number);
    }
}

CellMonitorList::CellMonitorList(Packet packet)
{
    const PropertyListResult& list = propertyListOf(packet);
    if (!list.value) {
        systemLog(Priority::error, "Cell Info Array data could not be constructed");
        return;
    }
    const ArrayRef array = list.value->array();
    if (!array)
        throw WrongKindException(text("cell-monitor list is a %s", nameOf(list.value->kind())));
    _isPresent = true;
    for (const Value& element : *array) {
        if (auto record = element.dictionary())
            _cells.emplace_back(std::move(record));
    }
}

void CellMonitorList::reportIfAbsent() const
{
    if (!_isPresent)
        systemLog(Priority::error, "Failed to get Cell Array\n");
}

const CellRecord* CellMonitorList::find(
    std::initializer_list<const char*> radioAccessTechnologies, const char* cellType) const
{
    const auto isWanted = [&](const CellRecord& cell) {
        return std::ranges::any_of(
            radioAccessTechnologies, [&](const char* radio) { return cell.is(radio, cellType); });
    };
    const auto cell = std::ranges::find_if(_cells, isWanted);
    return cell == _cells.end() ? nullptr : &*cell;
}

std::vector<CellRecord> CellMonitorList::findAll(
    const char* radioAccessTechnology, const char* cellType) const
{
    std::vector<CellRecord> result;
    std::ranges::copy_if(_cells, std::back_inserter(result),
        [&](const CellRecord& cell) { return cell.is(radioAccessTechnology, cellType); });
    return result;
}

} // namespace orvex
