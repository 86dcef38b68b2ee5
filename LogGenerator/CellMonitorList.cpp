#include "CellMonitorList.h"

#include "PropertyList.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <utility>

namespace orvex {

bool CellRecord::is(const char* radioAccessTechnology, const char* cellType) const
{
    return (*_record)[telephony::kCellRadioAccessTechnology] == Value(radioAccessTechnology)
        && (*_record)[telephony::kCellType] == Value(cellType);
}

std::optional<std::int32_t> CellRecord::number(const char* key) const
{
    const std::int64_t* entry = (*_record)[key].integer();
    if (!entry || !std::in_range<std::int32_t>(*entry))
        return std::nullopt;
    return static_cast<std::int32_t>(*entry);
}

void printServingCell(Rows& row, const CellRecord& cell, std::span<const CellEntry> entries)
{
    for (const CellEntry& entry : entries) {
        const auto number = cell.number(entry.key);
        if (!number) {
            systemLog(Priority::error, "Serving Cell Info: Failed to retrieve %s\n", entry.nameInMessage);
            continue;
        }
        row.print(entry.row, "%d", *number);
        if (entry.otherRow)
            row.print(entry.otherRow, "%d", *number);
    }
}

std::optional<std::vector<CellRecord>> CellMonitorList::read(Packet packet)
{
    const auto list = propertyListFromData(PacketReader(packet).from(kPacketHeaderLength).bytes());
    if (!list.value) {
        systemLog(Priority::error, "Cell Info Array data could not be constructed");
        return std::nullopt;
    }
    const ArrayRef array = list.value->array();
    if (!array)
        throw WrongKindException(text("cell-monitor list is a %s", nameOf(list.value->kind())));
    std::vector<CellRecord> records;
    for (const Value& element : *array) {
        if (auto record = element.dictionary())
            records.emplace_back(std::move(record));
    }
    return records;
}

} // namespace orvex
