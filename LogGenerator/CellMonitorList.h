#pragma once

#include "PacketReader.h"
#include "Rows.h"

#include "Array.h"
#include "Dictionary.h"

#include <optional>
#include <span>
#include <stdexcept>
#include <vector>

namespace orvex {

// One cell of the cell-monitor list: a dictionary with the keys that the telephony service gives.
class CellRecord {
public:
    explicit CellRecord(DictionaryRef record)
        : _record(std::move(record))
    {
    }

    // True when it has both entries and they are these texts.
    bool is(const char* radioAccessTechnology, const char* cellType) const;
    // The entry as a number. Only an integer that fits 32 bits with sign is one; absent otherwise.
    std::optional<std::int32_t> number(const char* key) const;

private:
    DictionaryRef _record;
};

// A number of a cell record and where it is shown.
struct CellEntry {
    const char* key;
    const char* row;
    const char* nameInMessage;
    const char* otherRow = nullptr; // shows the same number too; null when there is none
};

// Writes the rows of a serving cell's entries. An entry that is no number leaves its rows as they are, with
// the log line "Serving Cell Info: Failed to retrieve NAME".
void printServingCell(Rows& row, const CellRecord& cell, std::span<const CellEntry> entries);

// The cell-monitor list (extra code 0xFF0001): a property list with an array of cell records from byte 13 on.
class CellMonitorList {
public:
    // The list is a property list of another kind. Nobody catches it.
    class WrongKindException : public std::runtime_error {
    public:
        using std::runtime_error::runtime_error;
    };

    // The records in order; an element that is no dictionary is skipped. Absent, after the log line
    // "Cell Info Array data could not be constructed", when there is no property list.
    static std::optional<std::vector<CellRecord>> read(Packet packet);
};

} // namespace orvex
