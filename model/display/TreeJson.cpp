#include "TreeJson.h"

#include "NodesByPath.h"
#include "Quantity.h"

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>
#include <string>
#include <utility>

namespace orvex {

namespace {

constexpr std::size_t kIndentation = 2;

constexpr std::size_t kLevelsWithPaths = 32;

std::size_t levelsBelow(const OrvexModelNode& node)
{
    std::size_t levels = 0;
    if (const auto* children = node.childNodes()) {
        for (const auto& child : *children)
            levels = std::max(levels, 1 + levelsBelow(*child));
    }
    return levels;
}

// A null path writes none, here and below.
void writeNode(JsonWriter& json, const OrvexModelNode& node, const std::string* path)
{
    json.beginObject();
    json.member("name", node.displayName());
    if (path)
        json.member("path", *path);
    if (const auto* children = node.childNodes()) {
        json.key("children");
        json.beginArray();
        for (const auto& child : *children) {
            const std::string childPath = path ? pathByAppending(*path, child->displayName()) : "";
            writeNode(json, *child, path ? &childPath : nullptr);
        }
        json.endArray();
    } else if (const std::string* value = node.value()) {
        json.member("value", *value);
        if (const auto quantity = quantityOf(*value)) {
            json.key("number");
            json.number(quantity->number);
            json.member("unit", quantity->unit);
        }
    }
    json.endObject();
}

} // namespace

void JsonWriter::key(std::string_view name)
{
    string(name);
    _stream << (_isCompact ? ":" : ": ");
    _followsKey = true;
}

void JsonWriter::string(std::string_view text)
{
    using Json = nlohmann::json;
    beginValue();
    _stream << Json(text).dump(-1, ' ', false, Json::error_handler_t::replace);
}

void JsonWriter::number(double number)
{
    beginValue();
    _stream << nlohmann::json(number).dump();
}

void JsonWriter::number(std::size_t number)
{
    beginValue();
    _stream << number;
}

void JsonWriter::boolean(bool value)
{
    beginValue();
    _stream << (value ? "true" : "false");
}

void JsonWriter::null()
{
    beginValue();
    _stream << "null";
}

void JsonWriter::open(char bracket)
{
    beginValue();
    _stream << bracket;
    _isEmpty.push_back(true);
}

void JsonWriter::close(char bracket)
{
    const bool wasEmpty = _isEmpty.back();
    _isEmpty.pop_back();
    if (!wasEmpty && !_isCompact)
        beginLine();
    _stream << bracket;
}

void JsonWriter::beginValue()
{
    if (std::exchange(_followsKey, false) || _isEmpty.empty())
        return;
    if (!_isEmpty.back())
        _stream << ',';
    _isEmpty.back() = false;
    if (!_isCompact)
        beginLine();
}

void JsonWriter::beginLine()
{
    _stream << '\n';
    std::fill_n(std::ostreambuf_iterator<char>(_stream), kIndentation * _isEmpty.size(), ' ');
}

void writeTreeJson(JsonWriter& json, const OrvexModelNode& root, const std::string& path)
{
    const bool isDeep = levelsBelow(root) >= kLevelsWithPaths;
    const bool wasCompact = json.isCompact();
    json.setCompact(wasCompact || isDeep);
    writeNode(json, root, isDeep ? nullptr : &path);
    json.setCompact(wasCompact);
}

} // namespace orvex
