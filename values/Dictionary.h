#pragma once

#include "Value.h"

#include <cstdint>
#include <initializer_list>
#include <string_view>
#include <utility>

namespace orvex {

// A mutable dictionary with string keys, shared by reference (DictionaryRef). Not copyable by accident. Keys
// keep the order in which they were first set: setting a key again keeps its position, removing and setting
// it moves it to the end.
//
// Small dictionaries, such as the rows of a screen, are searched linearly. Large ones get an index whose hash
// is keyed, so chosen keys in a property list cannot slow down its look-up.
class Dictionary {
public:
    struct Entry {
        std::string key;
        Value value;

        friend bool operator==(const Entry&, const Entry&) = default;
    };

    Dictionary() = default;
    Dictionary(std::initializer_list<Entry> entries);
    Dictionary(const Dictionary&) = delete;
    Dictionary& operator=(const Dictionary&) = delete;

    static DictionaryRef make(std::initializer_list<Entry> entries = {});

    std::size_t size() const { return _entries.size(); }
    bool isEmpty() const { return _entries.empty(); }
    auto begin() const { return _entries.begin(); }
    auto end() const { return _entries.end(); }

    // The value under the key, or a null value.
    const Value& operator[](std::string_view key) const;
    bool contains(std::string_view key) const { return find(key) != kNotFound; }

    // The mutable value under the key, appended as null if there is none. Valid until the next change of the
    // dictionary.
    Value& slot(std::string_view key);
    // The same; also returns its position.
    Value& slot(std::string_view key, std::size_t& position);
    void set(std::string_view key, Value value) { slot(key) = std::move(value); }
    void reserve(std::size_t count) { _entries.reserve(count); }
    void remove(std::string_view key);
    // Removes all entries from the position on.
    void removeFrom(std::size_t position);
    // The mutable value at the position if it has that key, else null.
    Value* slotAt(std::size_t position, std::string_view key)
    {
        const bool isThere = position < _entries.size() && _entries[position].key == key;
        return isThere ? &_entries[position].value : nullptr;
    }

    // Number of entries of the source file left out because their keys are not strings. Not copied.
    std::size_t leftOut() const { return _leftOut; }
    void leaveOutOne() { ++_leftOut; }

    DictionaryRef shallowCopy() const;

    // Compares entries regardless of order.
    friend bool operator==(const Dictionary& left, const Dictionary& right);

private:
    static constexpr std::size_t kNotFound = static_cast<std::size_t>(-1);
    static constexpr std::size_t kSearchedDirectly = 24;

    std::size_t find(std::string_view key) const;
    // The key's place in the index, or the free place where it would go.
    std::size_t placeInIndex(std::string_view key) const;
    void rebuildIndex();

    std::vector<Entry> _entries;
    // Open addressing, size a power of two: each place holds a position in _entries plus one, or zero if
    // free. Empty while the dictionary is small.
    std::vector<std::uint32_t> _index;
    std::size_t _leftOut = 0;
};

} // namespace orvex
