#include "RowWriter.h"

namespace orvex {

Value& RowWriter::slotElsewhere(std::string_view name)
{
    // What stands from here on is left from before. As the next row is another one it goes, and the order is
    // the same as if the dictionary had been empty.
    end();
    std::size_t position = 0;
    Value& value = _dictionary->slot(name, position);
    _next = _isWrittenAnew ? _dictionary->size() : position + 1; // it may be a row that was set already
    return value;
}

void RowWriter::remove(std::string_view name)
{
    if (!_dictionary)
        return;
    if (_isWrittenAnew)
        end();
    _dictionary->remove(name);
    _next = _isWrittenAnew ? _dictionary->size() : 0;
}

} // namespace orvex
