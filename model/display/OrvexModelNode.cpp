#include "OrvexModelNode.h"

#include "ArrayLock.h"
#include "NodesByPath.h"

#include "Array.h"
#include "Dictionary.h"

#include <algorithm>
#include <string_view>

namespace orvex {

namespace {

constexpr std::string_view kSortedKey = "_sorted";

// "03;Serving Cell" is shown as "Serving Cell"; a key without or with several ";" as it stands.
std::string nameWithoutSortPrefix(const std::string& key)
{
    const auto separator = key.find(';');
    if (separator == std::string::npos || key.find(';', separator + 1) != std::string::npos)
        return key;
    return key.substr(separator + 1);
}

using Nodes = std::vector<OrvexModelNodeRef>;

OrvexModelNodeRef build(std::string name, const Value& object);

Nodes childrenInOrder(const Dictionary& dictionary)
{
    Nodes children;
    children.reserve(dictionary.size());
    for (const auto& [key, value] : dictionary) {
        if (!value.isNull())
            children.push_back(build(key, value));
    }
    return children;
}

Nodes childrenSorted(const Dictionary& dictionary)
{
    std::vector<const Dictionary::Entry*> entries;
    entries.reserve(dictionary.size());
    for (const Dictionary::Entry& entry : dictionary)
        entries.push_back(&entry);
    std::ranges::sort(entries, {}, &Dictionary::Entry::key);

    Nodes children;
    children.reserve(entries.size());
    for (const Dictionary::Entry* entry : entries) {
        if (entry->key != kSortedKey && !entry->value.isNull())
            children.push_back(build(nameWithoutSortPrefix(entry->key), entry->value));
    }
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
    if (const std::string* string = object.string())
        return std::make_shared<OrvexModelLeafNode>(std::move(name), *string);
    if (const Dictionary* dictionary = object.heldDictionary()) {
        const bool isSorted = dictionary->contains(kSortedKey);
        return std::make_shared<OrvexModelTreeNode>(
            std::move(name), isSorted ? childrenSorted(*dictionary) : childrenInOrder(*dictionary));
    }
    if (const Array* array = object.heldArray())
        return std::make_shared<OrvexModelTreeNode>(std::move(name), childrenOf(*array));
    return std::make_shared<OrvexModelLeafNode>(std::move(name), "(unknown)");
}

} // namespace

OrvexModelNodeRef OrvexModelNode::makeTreeFromObject(const Value& object, NodesByPath& pathDictionary)
{
    auto root = build("Orvex", object);
    pathDictionary = NodesByPath(root);
    return root;
}

} // namespace orvex
