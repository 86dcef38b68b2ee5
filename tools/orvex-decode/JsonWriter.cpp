#include "JsonWriter.h"

#include <nlohmann/json.hpp>

#include <iterator>
#include <utility>

namespace orvex {

namespace {
constexpr std::size_t kIndentation = 2;
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

} // namespace orvex
