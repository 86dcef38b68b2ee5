#pragma once

#include "modem/ModemPackets.h"

#include "FileStorage.h"
#include "FixedClock.h"
#include "LogGenerator.h"
#include "Shown.h"
#include "SystemLog.h"

#include <nlohmann/json.hpp>

namespace orvex::korat {

using Json = nlohmann::ordered_json;

// A value as ModemManager has it on the bus.
inline Value valueOf(const Json& json)
{
    if (json.is_object()) {
        const auto dictionary = Dictionary::make();
        for (const auto& [key, value] : json.items())
            dictionary->set(key, valueOf(value));
        return dictionary;
    }
    if (json.is_array()) {
        const auto array = Array::make();
        for (const Json& element : json)
            array->append(valueOf(element));
        return array;
    }
    if (json.is_string())
        return json.get<std::string>();
    if (json.is_boolean())
        return json.get<bool>();
    return json.is_number_float() ? Value(json.get<double>()) : Value(json.get<std::int64_t>());
}

// What a monitor shows after all messages about the state.
inline Value display(const char* technology, const ModemState& state, bool withMeasurements = false)
{
    installConsole([](std::string_view) {}); // some sections write a line for every packet
    FileResources resources(ORVEX_RESOURCES);
    test::FixedClock clock;
    const auto generator =
        LogGenerator::generatorFromTechnology(technology, {resources, clock, std::nullopt});
    const DictionaryRef shown = Dictionary::make();
    for (const Content& content : contentsFor(technology, state, withMeasurements))
        generator->updateState(*shown, messageOf(content, 1));
    return (*shown)["Display"];
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
