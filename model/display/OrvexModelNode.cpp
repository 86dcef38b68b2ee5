#include "OrvexModelNode.h"

#include "ArrayLock.h"
#include "OrvexModelLeafNode.h"
#include "OrvexModelTreeNode.h"

#include "Array.h"
#include "Dictionary.h"
#include "TextFormat.h"

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

class TreeBuilder {
public:
    explicit TreeBuilder(NodesByPath& nodesByPath)
        : _nodesByPath(nodesByPath)
    {
    }

    OrvexModelNodeRef build(std::string name, const Value& object, const std::string& path)
    {
        auto node = makeNode(std::move(name), object, path);
        _nodesByPath[path] = node;
        return node;
    }

private:
    OrvexModelNodeRef makeNode(std::string name, const Value& object, const std::string& path)
    {
        if (const std::string* string = object.string())
            return std::make_shared<OrvexModelLeafNode>(std::move(name), *string);
        if (const auto dictionary = object.dictionary())
            return std::make_shared<OrvexModelTreeNode>(std::move(name), childrenOf(*dictionary, path));
        if (const auto array = object.array())
            return std::make_shared<OrvexModelTreeNode>(std::move(name), childrenOf(*array, path));
        return std::make_shared<OrvexModelLeafNode>(std::move(name), "(unknown)");
    }

    std::vector<OrvexModelNodeRef> childrenOf(const Dictionary& dictionary, const std::string& path)
    {
        const bool isSorted = dictionary.contains(kSortedKey);
        std::vector<const Dictionary::Entry*> entries;
        entries.reserve(dictionary.size());
        for (const Dictionary::Entry& entry : dictionary)
            entries.push_back(&entry);
        if (isSorted)
            std::ranges::sort(entries, {}, &Dictionary::Entry::key);

        std::vector<OrvexModelNodeRef> children;
        children.reserve(entries.size());
        for (const Dictionary::Entry* entry : entries) {
            if (entry->key == kSortedKey || entry->value.isNull())
                continue;
            std::string name = isSorted ? nameWithoutSortPrefix(entry->key) : entry->key;
            const std::string childPath = pathByAppending(path, name);
            children.push_back(build(std::move(name), entry->value, childPath));
        }
        return children;
    }

    std::vector<OrvexModelNodeRef> childrenOf(const Array& array, const std::string& path)
    {
        const ArrayLockScope lock;
        std::vector<OrvexModelNodeRef> children;
        children.reserve(array.size());
        for (const Value& element : array) {
            std::string name = text("%d", static_cast<int>(children.size()));
            const std::string childPath = pathByAppending(path, name);
            children.push_back(build(std::move(name), element, childPath));
        }
        return children;
    }

    NodesByPath& _nodesByPath;
};

} // namespace

OrvexModelNodeRef OrvexModelNode::makeTreeFromObject(const Value& object, NodesByPath& pathDictionary)
{
    return TreeBuilder(pathDictionary).build("Orvex", object, "/");
}

std::string pathByAppending(const std::string& path, const std::string& component)
{
    const auto first = component.find_first_not_of('/');
    if (first == std::string::npos)
        return path;
    const auto last = component.find_last_not_of('/');
    return path + (path.ends_with('/') ? "" : "/") + component.substr(first, last - first + 1);
}

} // namespace orvex
