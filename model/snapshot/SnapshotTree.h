#pragma once

#include "OrvexModelNode.h"
#include "Snapshot.h"

#include "Dictionary.h"

#include <string>

namespace orvex {

// What a snapshot shows on the list screens: a branch for every entry that has a display, named by its
// description, then the size of the DLF and the user's description as texts.
OrvexModelNodeRef snapshotTree(const Snapshot& snapshot);

// The name of a snapshot's entry: its description.
std::string snapshotEntryName(const Dictionary& entry);

// Rows whose names may repeat: from the second on they are numbered, so that none hides another.
class NumberedRows {
public:
    explicit NumberedRows(std::initializer_list<Dictionary::Entry> rows = {})
        : _rows(Dictionary::make(rows))
    {
    }

    void add(const std::string& name, const Value& value);
    const DictionaryRef& dictionary() const { return _rows; }

private:
    DictionaryRef _rows;
    // The last number given to each name. A file may repeat a name a hundred thousand times, and searching
    // from 2 each time would take minutes.
    Dictionary _numbers;
};

} // namespace orvex
