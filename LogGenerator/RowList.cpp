#include "RowList.h"

namespace orvex {

RowWriter& RowList::next()
{
    if (!_list)
        return _row;
    _row.end();
    Value& element = nextElement();
    if (!element.ownDictionary())
        element = Dictionary::make();
    _row = RowWriter::anew(element.ownDictionary());
    return _row;
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
