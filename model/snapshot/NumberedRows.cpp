#include "NumberedRows.h"

namespace orvex {

void NumberedRows::add(const std::string& name, const Value& value)
{
    Value& last = _numbers.slot(name);
    std::int64_t number = last.integer() ? *last.integer() : 1;
    std::string free = name;
    while (_rows->contains(free))
        free = name + " (" + std::to_string(++number) + ')';
    last = number;
    _rows->set(free, value);
}

} // namespace orvex
