#include "RowWriter.h"

namespace orvex {

Value& RowWriter::slotElsewhere(std::string_view name)
{
    // The rows from here on are left over from before. The next row is a different one, so they go: the order
    // is then the same as in a dictionary that was empty.
    end();
    std::size_t position = 0;
    Value& value = _dictionary->slot(name, position);
    _next = _isWrittenAnew ? _dictionary->size() : position + 1; // the row may have been set already
    return value;
}

ArrayRef RowWriter::list(std::string_view name)
{
    if (!_dictionary)
        return nullptr;
    Value& value = slot(name);
    if (!value.ownArray())
        value = Array::make();
    return value.array();
}

void RowWriter::remove(std::string_view name)
{
    if (!_dictionary)
        return;
    end();
    _dictionary->remove(name);
    _next = _isWrittenAnew ? _dictionary->size() : 0;
}

RowWriter& RowList::next()
{
    _row.end();
    if (!_list)
        return _row;
    Value& element = nextElement();
    if (!element.ownDictionary())
        element = Dictionary::make();
    _row.beginAnew(*element.ownDictionary());
    return _row;
}

void RowList::append(DeferredText text)
{
    if (_list)
        nextElement().set(text);
}

Value& RowList::nextElement()
{
    return _count < _list->size() ? _list->slot(_count++) : (++_count, _list->appendSlot());
}

RowList::~RowList()
{
    _row.end();
    if (_list)
        _list->setAsideFrom(_count);
}

} // namespace orvex
