#include "RowList.h"

namespace orvex {

RowWriter& RowList::next()
{
    _row.end();
    if (!_list)
        return _row;
    Value& element = nextElement();
    if (!element.ownDictionary())
        element = Dictionary::make();
    _row = RowWriter::anew(*element.ownDictionary());
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
