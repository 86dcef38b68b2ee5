#pragma once

#include "Console.h"
#include "FileResources.h"
#include "FixedClock.h"
#include "LogGenerator.h"
#include "SectionFixture.h"

#include <memory>

namespace orvex::test {

// A real generator with its real template, and what it shows after the messages it was fed.
class Decoding {
public:
    explicit Decoding(const char* technology)
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        _generator = LogGenerator::generatorFromTechnology(technology, {_resources, _clock, std::nullopt});
    }
    ~Decoding()
    {
        _generator.reset();
        installConsole({});
    }
    Decoding(const Decoding&) = delete;
    Decoding& operator=(const Decoding&) = delete;

    void feed(const Bytes& message) { _generator->updateState(*_state, message); }

    // Null before the first message.
    DictionaryRef display() const { return (*_state)["Display"].dictionary(); }

    // The rows of a section that have a value as a list of one; a list section record by record.
    std::vector<RowTexts> rows(const char* name) const
    {
        const Value section = find(*display(), name);
        if (const auto dictionary = section.dictionary()) {
            RowTexts rows = rowsOf(dictionary);
            std::erase_if(rows, [](const auto& row) { return isUnset(row.second); });
            return {rows};
        }
        std::vector<RowTexts> result;
        if (const auto array = section.array()) {
            for (const Value& element : *array)
                result.push_back(rowsOf(element.dictionary()));
        }
        return result;
    }

    // What a template shows where nothing has come yet.
    static bool isUnset(const std::string& text) { return text.empty() || text == "—" || text == "[]"; }

private:
    static Value find(const Dictionary& dictionary, const char* name)
    {
        if (const Value& here = dictionary[name]; !here.isNull())
            return here;
        for (const auto& entry : dictionary) {
            const auto group = entry.value.dictionary();
            if (Value inside = group ? find(*group, name) : Value(); !inside.isNull())
                return inside;
        }
        return {};
    }

    FileResources _resources{ORVEX_RESOURCES};
    FixedClock _clock;
    DictionaryRef _state = Dictionary::make();
    std::unique_ptr<LogGenerator> _generator;
};

} // namespace orvex::test
