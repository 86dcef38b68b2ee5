#pragma once

#include "OrvexModelNode.h"

#include <string_view>

namespace orvex {

// The path dictionary of one tree: every node under its path. The root's path is "/"; a child's is that of
// its parent and its display name without the "/" at both ends, with one "/" between the two. A name of
// nothing else leaves the path as it is. Of two nodes with one path there is the one that a walk of the tree,
// children before their parent, comes to last.
//
// Nothing is stored: of the thousand nodes of a tree the screens ask for two or three before the next refresh
// throws it away, and those are found along the names.
class NodesByPath {
public:
    NodesByPath() = default; // of no tree
    explicit NodesByPath(OrvexModelNodeRef root)
        : _root(std::move(root))
    {
    }

    // Null when there is none.
    OrvexModelNodeRef operator[](std::string_view path) const;

private:
    OrvexModelNodeRef _root;
};

// The path of a child with that display name.
std::string pathByAppending(const std::string& path, const std::string& component);

} // namespace orvex
