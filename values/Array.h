#pragma once

#include "Value.h"

#include <initializer_list>

namespace orvex {

// A mutable list of values, shared by reference (ArrayRef). Not copyable by accident.
class Array {
public:
    Array() = default;
    Array(std::initializer_list<Value> elements)
        : _elements(elements)
    {
    }
    Array(const Array&) = delete;
    Array& operator=(const Array&) = delete;

    static ArrayRef make(std::initializer_list<Value> elements = {});

    std::size_t size() const { return _elements.size(); }
    bool isEmpty() const { return _elements.empty(); }
    const Value& operator[](std::size_t index) const { return _elements[index]; }
    auto begin() const { return _elements.begin(); }
    auto end() const { return _elements.end(); }

    // Mutable element.
    Value& slot(std::size_t index) { return _elements[index]; }
    // Appends and returns an element, recycled if one was set aside, else null.
    Value& appendSlot();
    // Removes the elements from the index on and sets them aside for appendSlot().
    void setAsideFrom(std::size_t index);
    void reserve(std::size_t count) { _elements.reserve(count); }
    void append(Value value) { _elements.push_back(std::move(value)); }
    void appendAll(const Array& other);
    void removeAll() { _elements.clear(); }
    void removeFirst(std::size_t count);

    ArrayRef shallowCopy() const;

    friend bool operator==(const Array& left, const Array& right)
    {
        return left._elements == right._elements;
    }

private:
    std::vector<Value> _elements;
    std::vector<Value> _setAside; // not copied
};

} // namespace orvex
