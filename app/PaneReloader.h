#pragma once

#include "OrvexModelNode.h"

#include <functional>
#include <string>

namespace orvex {

class NavigationStack;

// Gives every list screen of the stack its node in the newest tree, from the root upward. Where a screen's
// path is gone, that screen and all above it are popped, animated. The root screen takes the root whether or
// not there is one.
void reloadPanes(NavigationStack& stack, const OrvexModelNodeRef& root,
    const std::function<OrvexModelNodeRef(const std::string& path)>& nodeAtPath);

} // namespace orvex
