#include "Contexts.h"

#include <algorithm>

namespace orvex {

Contexts::Contexts(std::string_view path)
    : _path(path)
{
}

bool Contexts::addRow(std::size_t number, const TimelineRow& row)
{
    const auto column = std::ranges::find_if(
        kColumns, [&](const char* name) { return !_path.empty() && row.path == _path + '/' + name; });
    if (column == kColumns.end())
        return false;
    auto found = _places.find(row.key);
    if (found == _places.end()) {
        if (_contexts.size() == kMostContexts) {
            if (column == kColumns.begin())
                ++_omitted;
            return false;
        }
        found = _places.emplace(row.key, _contexts.size()).first;
        _contexts.emplace_back();
    }
    _rows[number] = {found->second, static_cast<std::size_t>(column - kColumns.begin())};
    return true;
}

void Contexts::set(std::size_t number, const std::string& text, const Moment& now)
{
    const auto [place, column] = _rows.at(number);
    Context& context = _contexts[place];
    if (context.from == 0)
        context.from = now.position;
    context.until.reset();
    context.texts[column] = text;
}

void Contexts::clear(std::size_t number, const Moment& now)
{
    _contexts[_rows.at(number).context].until = now.position;
}

void Contexts::writeJson(JsonWriter& json) const
{
    json.key("contexts");
    json.beginObject();
    json.key("columns");
    json.beginArray();
    for (const char* column : kColumns)
        json.string(column);
    json.endArray();
    json.member("omitted", _omitted);
    json.key("rows");
    json.beginArray();
    for (const Context& context : _contexts) {
        json.beginObject();
        json.member("from", static_cast<std::size_t>(context.from));
        if (context.until)
            json.member("until", static_cast<std::size_t>(*context.until));
        json.key("texts");
        json.beginArray();
        for (const std::string& text : context.texts)
            json.string(text);
        json.endArray();
        json.endObject();
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
