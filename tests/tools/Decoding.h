#pragma once

#include "Console.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "LogGenerator.h"
#include "SectionFixture.h"

#include <memory>

namespace orvex::test {

// A real generator, and what it shows after the messages it was fed.
class Decoding {
public:
    explicit Decoding(const char* technology)
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        const auto dictionary = [] { return Dictionary::make(); };
        const auto array = [] { return Array::make(); };
        _resources.templates["LTE"] = Dictionary::make({{"Serving Cell Info", dictionary()},
            {"Connected mode LTE Intra-frequency Measurement", dictionary()},
            {"Measured Neighbor Cells", array()}, {"Detected Cells", array()},
            {"Serving Cell Measurements", dictionary()}, {"Neighbor Measurements", dictionary()},
            {"Neighbor Cells List", array()}, {"Reselection Candidates", dictionary()},
            {"Reselection Candidates List", array()}, {"SIM Info", dictionary()},
            {"PDP Context Info", array()}});
        _resources.templates["UTRAN"] =
            Dictionary::make({{"RRC Info", dictionary()}, {"Serving Cell Info", dictionary()},
                {"Neighbor Cell List", array()}, {"GSM Neighbor Cell List", array()}, {"TRCH BLER", array()},
                {"CCTRCH SIR", array()}, {"PDP Context Info", array()}, {"SIM Info", dictionary()}});
        _generator = LogGenerator::generatorFromTechnology(technology, {_resources, _clock, std::nullopt});
    }
    ~Decoding()
    {
        _generator.reset();
        installConsole({});
    }
    Decoding(const Decoding&) = delete;
    Decoding& operator=(const Decoding&) = delete;

    // False for a technology without a generator.
    bool isPossible() const { return _generator != nullptr; }
    void feed(const Bytes& message) { _generator->updateState(*_state, message); }

    // A section with rows as a list of one; a list section record by record.
    std::vector<RowTexts> rows(const char* name) const
    {
        const Value section = (*(*_state)["Display"].dictionary())[name];
        if (const auto dictionary = section.dictionary())
            return {rowsOf(dictionary)};
        std::vector<RowTexts> result;
        if (const auto array = section.array()) {
            for (const Value& element : *array)
                result.push_back(rowsOf(element.dictionary()));
        }
        return result;
    }

private:
    FixedResources _resources;
    FixedClock _clock;
    DictionaryRef _state = Dictionary::make();
    std::unique_ptr<LogGenerator> _generator;
};

} // namespace orvex::test
