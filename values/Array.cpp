#include "Array.h"

#include <algorithm>

namespace orvex {

ArrayRef Array::make(std::initializer_list<Value> elements)
{
    return std::make_shared<Array>(elements);
}

void Array::appendAll(const Array& other)
{
    // By index, because the other array may be this one.
    const std::size_t count = other.size();
    _elements.reserve(_elements.size() + count);
    for (std::size_t i = 0; i < count; ++i)
        _elements.push_back(other._elements[i]);
}

void Array::removeFirst(std::size_t count)
{
    const auto last = _elements.begin() + static_cast<std::ptrdiff_t>(std::min(count, _elements.size()));
    _elements.erase(_elements.begin(), last);
}

Value& Array::appendSlot()
{
    if (_setAside.empty())
        return _elements.emplace_back();
    _elements.push_back(std::move(_setAside.back()));
    _setAside.pop_back();
    return _elements.back();
}

void Array::setAsideFrom(std::size_t index)
{
    while (_elements.size() > index) {
        _setAside.push_back(std::move(_elements.back()));
        _elements.pop_back();
    }
}

ArrayRef Array::shallowCopy() const
{
    auto copy = std::make_shared<Array>();
    copy->_elements = _elements;
    return copy;
}

} // namespace orvex
