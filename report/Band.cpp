#include "Band.h"

namespace orvex {

void Band::add(std::int64_t position, const std::string& text)
{
    if (_changes.empty() ? text.empty() : _changes.back().text == text)
        return;
    if (!_changes.empty() && _changes.back().position == position)
        _changes.back().text = text;
    else if (_changes.size() == kLimit)
        ++_omitted;
    else
        _changes.push_back({position, text});
}

void Band::writeJson(JsonWriter& json) const
{
    json.beginObject();
    json.member("title", _title);
    json.key("isCell");
    json.boolean(_isCell);
    json.member("omitted", _omitted);
    json.key("times");
    json.beginArray();
    for (const Change& change : _changes)
        json.number(static_cast<std::size_t>(change.position));
    json.endArray();
    json.key("texts");
    json.beginArray();
    for (const Change& change : _changes) {
        if (change.text.empty())
            json.null();
        else
            json.string(change.text);
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
