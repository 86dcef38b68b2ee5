#pragma once

#include "CaptureDecoding.h"
#include "TreeJson.h"

#include <string>
#include <vector>

namespace orvex {

// What every JSON document has in common; docs/json.md describes it.
constexpr std::size_t kJsonSchema = 1;

// Begins the document of a capture: {"schema", "capture", …}. The caller adds members and ends the object.
void beginEnvelope(JsonWriter& json, const DecodedCapture& capture);

// Begins any other document: {"schema", KIND: PATH, …}.
void beginEnvelope(JsonWriter& json, const char* kind, const std::string& path);

void writeTexts(JsonWriter& json, const char* name, const std::vector<std::string>& texts);

// Writes one document, or an array of any other number. `write` gets the writer and an element.
template <typename Elements, typename Write>
void writeDocuments(std::ostream& stream, const Elements& elements, Write write)
{
    JsonWriter json(stream);
    const bool isArray = std::size(elements) != 1;
    if (isArray)
        json.beginArray();
    for (const auto& element : elements)
        write(json, element);
    if (isArray)
        json.endArray();
    json.endDocument();
}

} // namespace orvex
