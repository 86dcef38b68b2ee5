#include "Envelope.h"

namespace orvex {

namespace {

void writeCounts(JsonWriter& json, const CaptureCounts::Row& total)
{
    json.key("counts");
    json.beginObject();
    json.member("messages", total.messages);
    json.member("bytes", total.bytes);
    json.member("decoded", total.decoded);
    json.member("tooShort", total.tooShort);
    json.member("unwanted", total.unwanted());
    json.endObject();
}

} // namespace

void beginEnvelope(JsonWriter& json, const char* kind, const std::string& path)
{
    json.beginObject();
    json.member("schema", kJsonSchema);
    json.member(kind, path);
}

void beginEnvelope(JsonWriter& json, const DecodedCapture& capture)
{
    beginEnvelope(json, "capture", capture.path);
    if (!capture.technology.empty())
        json.member("technology", capture.technology);
    if (capture.hasFailed())
        json.member("error", capture.failure);
    if (!capture.counts)
        return;
    writeCounts(json, capture.counts->total());
    writeTexts(json, "errors", capture.errors);
}

void writeTexts(JsonWriter& json, const char* name, const std::vector<std::string>& texts)
{
    json.key(name);
    json.beginArray();
    for (const std::string& text : texts)
        json.string(text);
    json.endArray();
}

} // namespace orvex
