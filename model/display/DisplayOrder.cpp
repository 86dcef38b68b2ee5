#include "DisplayOrder.h"

#include <algorithm>

namespace orvex {

namespace {
constexpr std::string_view kSortedKey = "_sorted";
}

bool isSorted(const Dictionary& dictionary)
{
    return dictionary.contains(kSortedKey);
}

std::vector<const Dictionary::Entry*> sortedEntries(const Dictionary& dictionary)
{
    std::vector<const Dictionary::Entry*> entries;
    entries.reserve(dictionary.size());
    for (const Dictionary::Entry& entry : dictionary) {
        if (entry.key != kSortedKey && !entry.value.isNull())
            entries.push_back(&entry);
    }
    std::ranges::sort(entries, {}, &Dictionary::Entry::key);
    return entries;
}

std::string_view nameWithoutSortPrefix(std::string_view key)
{
    const auto separator = key.find(';');
    if (separator == std::string_view::npos || key.find(';', separator + 1) != std::string_view::npos)
        return key;
    return key.substr(separator + 1);
}

const std::string& shownText(const Value& value)
{
    static const std::string kUnknown = "(unknown)";
    const std::string* text = value.string();
    return text ? *text : kUnknown;
}

} // namespace orvex
