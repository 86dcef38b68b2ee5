#pragma once

#include "Dictionary.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// What tells an element of a list from the others: the rows that name it, such as "Physical Cell ID".
//
// Lists are sorted anew with every measurement, so the place in the list says nothing.
class ElementIdentity {
public:
    ElementIdentity() = default;
    explicit ElementIdentity(const Value& element);

    // True while the element still has the same rows in the same places, with the same identity.
    bool isStillOf(const Value& element) const;
    // "Scrambling Code 57, Carrier 10588". Empty when no row identifies the element.
    std::string text() const;

private:
    struct Row {
        std::size_t place; // in its dictionary
        std::string_view key;
        std::string text;
        std::size_t rank; // of the name, among those that identify
    };

    void readRows(const Dictionary& dictionary);

    std::optional<std::size_t> _size;  // of the element; none if it is no dictionary
    std::optional<std::size_t> _inner; // the place of the dictionary in the element that has the rows
    std::string _innerKey;
    std::vector<Row> _rows;
};

// A row outside of a list that also identifies its elements, such as the channel of all cells in it.
struct SharedIdentity {
    std::vector<const char*> path; // of keys
    const char* label;             // in the elements' keys
};
// Null when there is none for the list with that path.
const SharedIdentity* sharedIdentityOfList(std::string_view path);
// The row's text; null when it is not shown or empty.
const std::string* textOf(const SharedIdentity& identity, const Value& display);

// The display has lists as dictionaries too, whose names are data: "32: -7.02 dB" for a pilot. Returns what
// those names are ("Pilot"); null for all other dictionaries.
const char* elementNameOfDictionary(std::string_view path);

} // namespace orvex
