#pragma once

#include "Dictionary.h"

#include <string>

namespace orvex {

// Rows that may have one name, which would hide each other: from the second on they are numbered.
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
    // The last number of each name: a file may hold a name a hundred thousand times, and looking for a free
    // one from 2 on every time would take minutes.
    Dictionary _numbers;
};

} // namespace orvex
