#include "PropertyListNode.h"

#include <plist/plist.h>

namespace orvex {

void PropertyListNodeFree::operator()(void* node) const
{
    plist_free(node);
}

} // namespace orvex
