#include "RowList.h"

namespace orvex {

Rows& RowList::next()
{
    if (!_list)
        return _row;
    _row.end();
    Value& element = nextElement();
    if (!element.ownDictionary())
        element = Dictionary::make();
    _row = Rows::anew(element.ownDictionary());
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
