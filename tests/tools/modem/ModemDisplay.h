#pragma once

#include "modem/ModemPackets.h"

#include "Decoding.h"
#include "Shown.h"

namespace orvex::korat {

// What a monitor shows after all messages about the state.
inline Value display(const char* technology, const ModemState& state, bool withMeasurements = false)
{
    test::Decoding decoding(technology);
    for (const Content& content : contentsFor(technology, state, withMeasurements))
        decoding.feed(messageOf(content, 1));
    return decoding.display();
}

// The section of that name, in whatever group, without the rows that show nothing.
inline Value section(const Value& display, const char* name)
{
    const DictionaryRef sections = display.dictionary();
    if (!sections)
        return {};
    Value found = (*sections)[name].shallowCopy();
    for (const auto& [group, content] : *sections)
        found = found.isNull() ? section(content, name) : found;
    if (const DictionaryRef rows = found.dictionary()) {
        const DictionaryRef all = rows->shallowCopy();
        for (const auto& [row, text] : *all) {
            if (text == Value("—"))
                rows->remove(row);
        }
    }
    return found;
}

} // namespace orvex::korat
