#include "NumberedRows.h"

#include "TextFormat.h"

namespace orvex {

void NumberedRows::add(const std::string& name, const Value& value)
{
    int& number = _numbers.try_emplace(name, 1).first->second;
    std::string free = name;
    while (_rows->contains(free))
        free = text("%s (%d)", name.c_str(), ++number);
    _rows->set(free, value);
}

} // namespace orvex
