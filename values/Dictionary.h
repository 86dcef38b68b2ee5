#pragma once

#include "Value.h"

#include <cstdint>
#include <initializer_list>
#include <string_view>
#include <utility>

namespace orvex {

// A mutable dictionary with string keys, shared by reference (DictionaryRef). It cannot be copied by
// accident. Keys keep the order in which they were first set; setting a key again keeps its place, removing
// and setting it moves it to the end.
//
// Small dictionaries, the rows of a screen, are searched directly; large ones get an index, whose hash is
// keyed so that nobody who chooses the keys of a property list can make its look-up slow.
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

    // The value under the key; a null value when there is none.
    const Value& operator[](std::string_view key) const;
    bool contains(std::string_view key) const { return find(key) != kNotFound; }

    // The value to be written under the key, made at the end when there is none. The reference holds until
    // the next change of the dictionary.
    Value& slot(std::string_view key);
    // The same, and where it is.
    Value& slot(std::string_view key, std::size_t& position);
    void set(std::string_view key, Value value) { slot(key) = std::move(value); }
    // Room for so many entries, made at once.
    void reserve(std::size_t count) { _entries.reserve(count); }
    void remove(std::string_view key);
    // Removes all entries from the position on.
    void removeFrom(std::size_t position);
    // The value at the position, to be changed, when it is that key's; null otherwise.
    Value* slotAt(std::size_t position, std::string_view key)
    {
        const bool isThere = position < _entries.size() && _entries[position].key == key;
        return isThere ? &_entries[position].value : nullptr;
    }

    // Entries that the file the dictionary was read from has under keys that are no strings. They are not in
    // the dictionary; a copy knows nothing of them.
    std::size_t leftOut() const { return _leftOut; }
    void leaveOutOne() { ++_leftOut; }

    DictionaryRef shallowCopy() const;

    // Equal entries in any order.
    friend bool operator==(const Dictionary& left, const Dictionary& right);

private:
    static constexpr std::size_t kNotFound = static_cast<std::size_t>(-1);
    static constexpr std::size_t kSearchedDirectly = 24;

    std::size_t find(std::string_view key) const;
    // The place in the index that is the key's, or free for it.
    std::size_t placeInIndex(std::string_view key) const;
    void rebuildIndex();

    std::vector<Entry> _entries;
    // Open addressing, its size a power of two: each place holds a position in _entries plus one, or zero
    // when it is free. Empty while the dictionary is small.
    std::vector<std::uint32_t> _index;
    std::size_t _leftOut = 0;
};

} // namespace orvex
