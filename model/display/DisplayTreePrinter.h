#pragma once

#include "OrvexModelNode.h"

#include "VisibleText.h"

#include <string>
#include <vector>

namespace orvex {

// The display tree as text for a terminal or a file: one line per node, the root first, two blanks of indent
// per level. A branch is its name, a leaf "name: value".
//
// Names and values come from the network and from SIM cards, so characters that would break a line or
// control a terminal are escaped: a line break as \n, others as \x1b.
class DisplayTreePrinter {
public:
    static std::vector<std::string> lines(
        const OrvexModelNode& root, std::size_t longest = kLongestVisibleText);
    // The same lines, each ended by a line break.
    static std::string text(const OrvexModelNode& root, std::size_t longest = kLongestVisibleText);
};

} // namespace orvex
