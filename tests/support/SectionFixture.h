#pragma once

#include "Base.h"
#include "RecordingLog.h"

#include <gtest/gtest.h>

namespace orvex::test {

using RowTexts = std::vector<std::pair<std::string, std::string>>;

// The rows of a dictionary in their order; a container in a row is shown as [a, b].
inline std::string textOf(const Value& value)
{
    if (value.string())
        return *value.string();
    std::string result;
    if (const auto array = value.array()) {
        for (const Value& element : *array)
            result += (result.empty() ? "" : ", ") + textOf(element);
        return "[" + result + "]";
    }
    return std::string("(") + nameOf(value.kind()) + ")";
}

inline RowTexts rowsOf(const DictionaryRef& dictionary)
{
    RowTexts result;
    if (dictionary) {
        for (const auto& [key, value] : *dictionary)
            result.emplace_back(key, textOf(value));
    }
    return result;
}

// The text of one row; "(absent)" when there is no such row.
inline std::string textOf(const RowTexts& rows, const char* name)
{
    for (const auto& [row, text] : rows) {
        if (row == name)
            return text;
    }
    return "(absent)";
}

// One section on its own, bound to an empty dictionary, or to an array with a stale element.
template <typename Section>
class SectionFixture {
public:
    SectionFixture() { log.take(); }

    // Binds a new container, feeds one packet and returns what it wrote.
    RowTexts rowsAfter(const Bytes& packet, LogCode code)
    {
        const auto dictionary = Dictionary::make();
        section.updateSectionRef(dictionary);
        log.take();
        section.updateWithData(packet, code);
        return rowsOf(dictionary);
    }

    std::vector<RowTexts> listAfter(const Bytes& packet, LogCode code)
    {
        const auto array = Array::make({"stale"});
        section.updateSectionRef(array);
        log.take();
        section.updateWithData(packet, code);
        std::vector<RowTexts> result;
        for (const Value& element : *array)
            result.push_back(
                element.string() ? RowTexts{{"", *element.string()}} : rowsOf(element.dictionary()));
        return result;
    }

    RecordingLog log;
    ClassDictionary classDict;
    CodeDictionary codeDict;
    Section section{classDict, codeDict};
};

} // namespace orvex::test
