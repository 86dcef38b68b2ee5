#pragma once

#include "Console.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "LogGenerator.h"
#include "SectionFixture.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex::test {

// A real generator, and what it shows after the messages it was fed.
class Decoding {
public:
    explicit Decoding(const char* technology)
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        _resources.templates["LTE"] = Dictionary::make({
            {"Serving Cell Info", Dictionary::make()},
            {"Connected mode LTE Intra-frequency Measurement", Dictionary::make()},
            {"Measured Neighbor Cells", Array::make()},
            {"Detected Cells", Array::make()},
            {"Serving Cell Measurements", Dictionary::make()},
            {"Neighbor Measurements", Dictionary::make()},
            {"Neighbor Cells List", Array::make()},
            {"Reselection Candidates", Dictionary::make()},
            {"Reselection Candidates List", Array::make()},
            {"SIM Info", Dictionary::make()},
            {"PDP Context Info", Array::make()},
        });
        _resources.templates["UTRAN"] = Dictionary::make({
            {"RRC Info", Dictionary::make()},
            {"Serving Cell Info", Dictionary::make()},
            {"Neighbor Cell List", Array::make()},
            {"GSM Neighbor Cell List", Array::make()},
            {"TRCH BLER", Array::make()},
            {"CCTRCH SIR", Array::make()},
            {"PDP Context Info", Array::make()},
            {"SIM Info", Dictionary::make()},
        });
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

    Value section(const char* name) const { return (*(*_state)["Display"].dictionary())[name]; }

    // A section with rows as a list of one; a list section record by record.
    std::vector<RowTexts> rows(const char* name) const
    {
        if (const auto dictionary = section(name).dictionary())
            return {rowsOf(dictionary)};
        std::vector<RowTexts> result;
        if (const auto array = section(name).array()) {
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
