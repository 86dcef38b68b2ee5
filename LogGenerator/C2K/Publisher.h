#pragma once

#include "Dictionary.h"

namespace orvex {

// Puts values into the display by internal key, "kRxAGC0" say, and knows nothing of sections and rows: the
// lookup leads from a key to every row that shows it, and there may be any number of them.
//
// The lookup is a dictionary: internal key to an array of {"key": the row's name, "dict": the display
// dictionary that holds the row}.
class Publisher {
public:
    // A publisher without a lookup drops what it is given.
    explicit Publisher(DictionaryRef lookup)
        : _lookup(std::move(lookup))
    {
    }

    // One more row that shows the internal key.
    static void addRow(Dictionary& lookup, const std::string& internalKey, const std::string& row,
        const DictionaryRef& dict);

    // Makes the value the content of the rows, in the order in which they were added. A damaged entry ends
    // it.
    void publish(const char* internalKey, const Value& value) const;
    // The text by a printf format.
    template <typename... Arguments>
    void setText(const char* internalKey, PrintfFormat<std::type_identity_t<Arguments>...> format,
        Arguments... arguments) const
    {
        publish(internalKey, DeferredText(format, arguments...));
    }

private:
    DictionaryRef _lookup;
};

} // namespace orvex
