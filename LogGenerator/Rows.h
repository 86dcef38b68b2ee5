#pragma once

#include "Dictionary.h"

namespace orvex {

// Writes rows, name and text, into one dictionary of the display: a section's own, or a record's in a list.
// A writer over nothing drops what it is given.
class Rows {
public:
    explicit Rows(DictionaryRef dictionary)
        : _dictionary(std::move(dictionary))
    {
    }
    // Over a new, empty dictionary.
    static Rows make() { return Rows(Dictionary::make()); }

    void set(const char* name, Value value);
    // The text by a printf format.
    [[gnu::format(printf, 3, 4)]] void print(const char* name, const char* format, ...);
    void remove(const char* name);

    const DictionaryRef& dictionary() const { return _dictionary; }

private:
    DictionaryRef _dictionary;
};

} // namespace orvex
