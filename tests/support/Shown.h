#pragma once

#include "Array.h"
#include "Dictionary.h"

#include <string>

namespace orvex::test {

std::string shown(const Value& value);

// "Row=text, Row=text", in the order of the rows.
inline std::string shown(const Dictionary& rows)
{
    std::string result;
    for (const auto& [row, value] : rows)
        result += (result.empty() ? "" : ", ") + row + "=" + shown(value);
    return result;
}

// "first | second" of a list's records.
inline std::string shown(const Array& list)
{
    std::string result;
    for (const Value& record : list) {
        const auto rows = record.dictionary();
        result += (&record == &list[0] ? "" : " | ") + (rows ? shown(*rows) : shown(record));
    }
    return result;
}

// A text as it is, a container in brackets, of other values the kind.
inline std::string shown(const Value& value)
{
    if (value.string())
        return *value.string();
    if (const auto rows = value.dictionary())
        return "{" + shown(*rows) + "}";
    if (const auto list = value.array())
        return "[" + shown(*list) + "]";
    return std::string("(") + nameOf(value.kind()) + ")";
}

} // namespace orvex::test
