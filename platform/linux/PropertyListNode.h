#pragma once

#include <memory>

namespace orvex {

struct PropertyListNodeFree {
    void operator()(void* node) const;
};

// A node of libplist that is not part of a tree, with all below it.
using PropertyListNode = std::unique_ptr<void, PropertyListNodeFree>;

} // namespace orvex
