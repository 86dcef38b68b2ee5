#include "Rows.h"

#include "TextFormat.h"

namespace orvex {

void Rows::set(const char* name, Value value)
{
    if (_dictionary)
        _dictionary->set(name, std::move(value));
}

void Rows::print(const char* name, const char* format, ...)
{
    if (!_dictionary)
        return;
    Value& slot = _dictionary->slot(name);
    if (!slot.string())
        slot = std::string();
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(*slot.string(), format, arguments); // into the row's own storage
    va_end(arguments);
}

void Rows::remove(const char* name)
{
    if (_dictionary)
        _dictionary->remove(name);
}

} // namespace orvex
