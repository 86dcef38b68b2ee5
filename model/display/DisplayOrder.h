#pragma once

#include "Dictionary.h"

#include <concepts>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// The order and the names in which a dictionary of the display is shown. Its own order and keys; with the key
// "_sorted" the string order of the keys, and a key of the form "prefix;name" under its name. Null values are
// not shown.

bool isSorted(const Dictionary& dictionary);
std::vector<const Dictionary::Entry*> sortedEntries(const Dictionary& dictionary);
// "03;Serving Cell" is shown as "Serving Cell"; a key without or with several ";" as it stands.
std::string_view nameWithoutSortPrefix(std::string_view key);

// Calls visit(name, entry) for everything that the dictionary shows.
template <std::invocable<std::string_view, const Dictionary::Entry&> Visit>
void visitShown(const Dictionary& dictionary, Visit visit)
{
    if (isSorted(dictionary)) {
        for (const Dictionary::Entry* entry : sortedEntries(dictionary))
            visit(nameWithoutSortPrefix(entry->key), *entry);
        return;
    }
    for (const Dictionary::Entry& entry : dictionary) {
        if (!entry.value.isNull())
            visit(std::string_view(entry.key), entry);
    }
}

// The text of a row: that of a text, "(unknown)" for what is neither a text nor a container.
const std::string& shownText(const Value& value);

} // namespace orvex
