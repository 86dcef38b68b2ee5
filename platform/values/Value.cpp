#include "Value.h"

#include "Array.h"
#include "Dictionary.h"

namespace orvex {

namespace {
template <typename Reference>
Reference referenceIn(const auto& content)
{
    const auto* reference = std::get_if<Reference>(&content);
    return reference ? *reference : nullptr;
}
} // namespace

Value::Value(BytesRef data)
{
    if (data)
        _content = std::move(data);
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

BytesRef Value::data() const
{
    return referenceIn<BytesRef>(_content);
}
ArrayRef Value::array() const
{
    return referenceIn<ArrayRef>(_content);
}
DictionaryRef Value::dictionary() const
{
    return referenceIn<DictionaryRef>(_content);
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
    if (const ArrayRef elements = array()) {
        auto copy = Array::make();
        for (const Value& element : *elements)
            copy->append(element.deepCopy());
        return copy;
    }
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
    default: return left._content == right._content;
    }
}

const char* nameOf(Value::Kind kind)
{
    static constexpr const char* kNames[] = {
        "null", "string", "integer", "real", "boolean", "date", "data", "array", "dictionary"};
    return kNames[static_cast<std::size_t>(kind)];
}

} // namespace orvex
