#pragma once

#include "PacketReader.h"
#include "RowWriter.h"

#include "Array.h"
#include "Dictionary.h"

#include <initializer_list>
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

    // True when both entries are these texts.
    bool is(const char* radioAccessTechnology, const char* cellType) const;
    // The entry as a number. Only an integer that fits 32 bits with sign is one; absent otherwise.
    std::optional<std::int32_t> number(const char* key) const;

private:
    DictionaryRef _record;
};

// How a cell record's number is shown.
enum class CellNumber {
    whole,
    low16Bits, // unsigned
    level,     // the low 16 bits with sign; 32767 stands for not measured and is shown as an empty text
    levelBy2,  // the same, in steps of two units
};

// A number of a cell record and where it is shown.
struct CellEntry {
    const char* key;
    const char* row;
    const char* nameInMessage;
    CellNumber form = CellNumber::whole;
    const char* unit = "";          // of a level, the blank before it included
    const char* otherRow = nullptr; // shows the same number too; null when there is none
};

// Writes the rows of a cell's entries. An entry that is no number leaves its rows as they are, with the log
// line "SECTION: Failed to retrieve NAME".
void printCell(
    RowWriter& row, const CellRecord& cell, std::span<const CellEntry> entries, const char* sectionInMessage);

// The cell-monitor list (extra code 0xFF0001): a property list with an array of cell records from byte 13 on.
class CellMonitorList {
public:
    static constexpr LogCode kCode = kExtraCodeCellMonitorList;
    static constexpr std::size_t kMinimumLength = 0;

    // The property list is not an array. Never caught.
    class WrongKindException : public std::runtime_error {
    public:
        using std::runtime_error::runtime_error;
    };

    // Logs "Cell Info Array data could not be constructed" when there is no property list.
    explicit CellMonitorList(Packet packet);

    // Logs "Failed to get Cell Array" when there was no property list, and so no cells.
    void reportIfAbsent() const;
    // The first cell of the type in one of the technologies; null when there is none.
    const CellRecord* find(
        std::initializer_list<const char*> radioAccessTechnologies, const char* cellType) const;
    // All cells of the type in the technology.
    std::vector<CellRecord> findAll(const char* radioAccessTechnology, const char* cellType) const;

private:
    bool _isPresent = false;
    std::vector<CellRecord> _cells;
};

} // namespace orvex
