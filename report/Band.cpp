#include "Band.h"

#include <algorithm>
#include <utility>

namespace orvex {

void Band::add(std::int64_t position, const std::string& text)
{
    if (_changes.empty() ? text.empty() : _changes.back().text == text)
        return;
    _changes.push_back({position, text});
    if (_changes.size() <= kLimit)
        return;
    const auto buckets = static_cast<std::int64_t>(kLimit / 2);
    const std::int64_t length = position - _changes.front().position + 1;
    if (_bucket == 0)
        _bucket = (length + buckets - 1) / buckets;
    while (_bucket * buckets < length)
        _bucket *= 2;
    thin();
}

void Band::finish()
{
    if (_bucket != 0)
        thin(); // what came after the last time has all its changes
}

void Band::thin()
{
    std::vector<Change> kept;
    const auto keep = [&](std::int64_t position, const std::string& text) {
        if (kept.empty() || kept.back().text != text)
            kept.push_back({position, text});
    };
    std::size_t i = 0;
    std::int64_t from = _changes.front().position;
    // What the last bucket will hold is not known yet.
    const auto end = [&] { return (from / _bucket + 1) * _bucket; };
    while (end() <= _changes.back().position) {
        const std::string* text = &_changes[i].text;
        std::int64_t longest = -1;
        for (std::int64_t start = from; start < end();) {
            const std::int64_t next = std::min(_changes[i + 1].position, end());
            if (next - start > longest) {
                longest = next - start;
                text = &_changes[i].text;
            }
            if (_changes[i + 1].position <= end())
                ++i;
            start = next;
        }
        keep(from, *text);
        from = end();
    }
    keep(from, _changes[i].text);
    for (++i; i < _changes.size(); ++i)
        keep(_changes[i].position, _changes[i].text);
    _changes = std::move(kept);
}

void Band::writeJson(JsonWriter& json) const
{
    json.beginObject();
    json.member("title", _title);
    json.key("isCell");
    json.boolean(_isCell);
    json.member("bucket", static_cast<std::size_t>(_bucket));
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
