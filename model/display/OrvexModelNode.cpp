#include "OrvexModelNode.h"

#include "ArrayLock.h"
#include "DisplayOrder.h"
#include "NodesByPath.h"

#include "Array.h"
#include "Dictionary.h"

#include <string_view>

namespace orvex {

namespace {

using Nodes = std::vector<OrvexModelNodeRef>;

OrvexModelNodeRef build(std::string name, const Value& object);

Nodes childrenOf(const Dictionary& dictionary)
{
    Nodes children;
    children.reserve(dictionary.size());
    visitShown(dictionary, [&](std::string_view name, const Dictionary::Entry& entry) {
        children.push_back(build(std::string(name), entry.value));
    });
    return children;
}

Nodes childrenOf(const Array& array)
{
    const ArrayLockScope lock;
    Nodes children;
    children.reserve(array.size());
    for (const Value& element : array)
        children.push_back(build(std::to_string(children.size()), element));
    return children;
}

OrvexModelNodeRef build(std::string name, const Value& object)
{
    if (const Dictionary* dictionary = object.heldDictionary())
        return std::make_shared<OrvexModelTreeNode>(std::move(name), childrenOf(*dictionary));
    if (const Array* array = object.heldArray())
        return std::make_shared<OrvexModelTreeNode>(std::move(name), childrenOf(*array));
    return std::make_shared<OrvexModelLeafNode>(std::move(name), shownText(object));
}

} // namespace

OrvexModelNodeRef OrvexModelNode::makeTreeFromObject(const Value& object, NodesByPath& pathDictionary)
{
    auto root = build("Orvex", object);
    pathDictionary = NodesByPath(root);
    return root;
}

} // namespace orvex
