#pragma once

#include "OrvexModelNode.h"

#include <string_view>

namespace orvex {

// The path dictionary of one tree: every node under its path. The root's path is "/"; a child's is its
// parent's and its own display name, without the "/" at both ends, with one "/" between. A name of nothing
// but "/" adds nothing. Of two nodes with the same path it has the one that a walk of the tree, children
// before their parent, reaches last.
//
// Nothing is stored: the screens ask for two or three of a tree's thousand nodes before the next refresh
// discards it, so a look-up follows the names instead.
class NodesByPath {
public:
    NodesByPath() = default; // without a tree
    explicit NodesByPath(OrvexModelNodeRef root)
        : _root(std::move(root))
    {
    }

    // Null when there is none.
    OrvexModelNodeRef operator[](std::string_view path) const;

private:
    OrvexModelNodeRef _root;
};

// What a display name adds to a path: the name without the "/" at both ends.
std::string_view withoutSlashesAround(std::string_view name);
// The path of a child with that display name.
std::string pathByAppending(const std::string& path, std::string_view component);

} // namespace orvex
