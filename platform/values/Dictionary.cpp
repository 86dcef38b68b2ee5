#include "Dictionary.h"

#include <algorithm>

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
        if (!_index.empty())
            _index.emplace(key, position);
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
        const auto found = _index.find(key);
        return found == _index.end() ? kNotFound : found->second;
    }
    for (std::size_t i = 0; i < _entries.size(); ++i) {
        if (_entries[i].key == key)
            return i;
    }
    return kNotFound;
}

void Dictionary::rebuildIndex()
{
    _index.clear();
    if (_entries.size() <= kSearchedDirectly)
        return;
    for (std::size_t i = 0; i < _entries.size(); ++i)
        _index.emplace(_entries[i].key, i);
}

} // namespace orvex
