#include "Value.h"

#include "Array.h"
#include "Dictionary.h"

#include <algorithm>

namespace orvex {

void PiecedBytes::append(BytesRef bytes, std::size_t offset)
{
    _size += bytes->size() - offset;
    _pieces.push_back({std::move(bytes), offset});
}

std::vector<ByteView> PiecedBytes::pieces() const
{
    std::vector<ByteView> result;
    for (const auto& [bytes, offset] : _pieces)
        result.push_back(ByteView(*bytes).subspan(offset));
    return result;
}

Value::Value(BytesRef data)
{
    if (data)
        _content = std::move(data);
}

Value::Value(PiecedBytes data)
    : _content(std::make_shared<const PiecedBytes>(std::move(data)))
{
}

Value::Value(ArrayRef array)
{
    if (array)
        _content = std::move(array);
}

Value::Value(DictionaryRef dictionary)
{
    if (dictionary)
        _content = std::move(dictionary);
}

Value::Value(Set set)
{
    if (set.elements)
        _content = std::move(set);
}

std::vector<ByteView> Value::dataPieces() const
{
    if (const auto* pieced = std::get_if<PiecedBytesRef>(&_content))
        return (*pieced)->pieces();
    const auto& whole = reference<BytesRef>();
    return whole ? std::vector{ByteView(*whole)} : std::vector<ByteView>();
}

void Value::joinPieces() const
{
    if (!std::holds_alternative<PiecedBytesRef>(_content))
        return;
    auto joined = std::make_shared<Bytes>();
    const PiecedBytesRef& pieced = std::get<PiecedBytesRef>(_content);
    joined->reserve(pieced->size());
    for (const ByteView piece : pieced->pieces())
        joined->insert(joined->end(), piece.begin(), piece.end());
    _content = std::move(joined);
}

Value Value::shallowCopy() const
{
    switch (kind()) {
    case Kind::data: return std::make_shared<Bytes>(*data());
    case Kind::array: return array()->shallowCopy();
    case Kind::dictionary: return dictionary()->shallowCopy();
    default: return *this;
    }
}

Value Value::deepCopy() const
{
    const auto copyOf = [](const Array& elements) {
        auto copy = Array::make();
        for (const Value& element : elements)
            copy->append(element.deepCopy());
        return copy;
    };
    if (const Array* elements = heldArray())
        return copyOf(*elements);
    if (const Set* held = set())
        return Set{copyOf(*held->elements)};
    if (kind() == Kind::data)
        return *this; // buffers in values are immutable
    if (const DictionaryRef entries = dictionary()) {
        auto copy = Dictionary::make();
        for (const auto& [key, value] : *entries)
            copy->set(key, value.deepCopy());
        return copy;
    }
    return shallowCopy();
}

bool operator==(const Value& left, const Value& right)
{
    if (left.kind() != right.kind())
        return false;
    switch (left.kind()) {
    case Value::Kind::data: return *left.data() == *right.data();
    case Value::Kind::array: return *left.array() == *right.array();
    case Value::Kind::dictionary: return *left.dictionary() == *right.dictionary();
    case Value::Kind::string: return *left.string() == *right.string();
    case Value::Kind::null: return true;
    case Value::Kind::integer: return *left.integer() == *right.integer();
    case Value::Kind::real: return *left.real() == *right.real();
    case Value::Kind::boolean: return *left.boolean() == *right.boolean();
    case Value::Kind::date: return *left.date() == *right.date();
    case Value::Kind::uid: return *left.uid() == *right.uid();
    case Value::Kind::set:
        return std::is_permutation(left.set()->elements->begin(), left.set()->elements->end(),
            right.set()->elements->begin(), right.set()->elements->end());
    }
    return false;
}

const char* nameOf(Value::Kind kind)
{
    static constexpr const char* kNames[] = {
        "null", "string", "integer", "real", "boolean", "date", "data", "array", "dictionary", "UID", "set"};
    return kNames[static_cast<std::size_t>(kind)];
}

} // namespace orvex
