#include "Dictionary.h"

#include "SipHash.h"

#include <algorithm>
#include <bit>

namespace orvex {

Dictionary::Dictionary(std::initializer_list<Entry> entries)
{
    for (const Entry& entry : entries)
        set(entry.key, entry.value);
}

DictionaryRef Dictionary::make(std::initializer_list<Entry> entries)
{
    return std::make_shared<Dictionary>(entries);
}

const Value& Dictionary::operator[](std::string_view key) const
{
    static const Value kAbsent;
    const std::size_t position = find(key);
    return position == kNotFound ? kAbsent : _entries[position].value;
}

Value& Dictionary::slot(std::string_view key)
{
    std::size_t position = kNotFound;
    return slot(key, position);
}

Value& Dictionary::slot(std::string_view key, std::size_t& position)
{
    position = find(key);
    if (position == kNotFound) {
        position = _entries.size();
        _entries.emplace_back().key = key;
        if (_entries.size() * 2 <= _index.size())
            _index[placeInIndex(key)] = static_cast<std::uint32_t>(position + 1);
        else if (_entries.size() > kSearchedDirectly)
            rebuildIndex();
    }
    return _entries[position].value;
}

void Dictionary::remove(std::string_view key)
{
    const std::size_t position = find(key);
    if (position == kNotFound)
        return;
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(position));
    if (!_index.empty())
        rebuildIndex();
}

void Dictionary::removeFrom(std::size_t position)
{
    if (position >= _entries.size())
        return;
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(position), _entries.end());
    if (!_index.empty())
        rebuildIndex();
}

DictionaryRef Dictionary::shallowCopy() const
{
    auto copy = std::make_shared<Dictionary>();
    copy->_entries = _entries;
    copy->_index = _index;
    return copy;
}

bool operator==(const Dictionary& left, const Dictionary& right)
{
    return left.size() == right.size()
        && std::all_of(left.begin(), left.end(), [&](const Dictionary::Entry& entry) {
               return right.contains(entry.key) && right[entry.key] == entry.value;
           });
}

std::size_t Dictionary::find(std::string_view key) const
{
    if (!_index.empty()) {
        const std::uint32_t found = _index[placeInIndex(key)];
        return found == 0 ? kNotFound : found - 1;
    }
    for (std::size_t i = 0; i < _entries.size(); ++i) {
        if (_entries[i].key == key)
            return i;
    }
    return kNotFound;
}

std::size_t Dictionary::placeInIndex(std::string_view key) const
{
    const std::size_t mask = _index.size() - 1;
    std::size_t place = sipHash(key) & mask;
    while (_index[place] != 0 && _entries[_index[place] - 1].key != key)
        place = (place + 1) & mask;
    return place;
}

void Dictionary::rebuildIndex()
{
    _index.clear();
    if (_entries.size() <= kSearchedDirectly)
        return;
    _index.resize(std::bit_ceil(_entries.size() * 4));
    for (std::size_t i = 0; i < _entries.size(); ++i)
        _index[placeInIndex(_entries[i].key)] = static_cast<std::uint32_t>(i + 1);
}

} // namespace orvex
