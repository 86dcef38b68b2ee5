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
    struct Line {
        std::string text;
        std::size_t nameEnd; // in bytes, with the indent; the size of the text where there is no value
    };

    static std::vector<Line> lines(const OrvexModelNode& root, std::size_t longest = kLongestVisibleText);
    // The same lines, each ended by a line break.
    static std::string text(const OrvexModelNode& root, std::size_t longest = kLongestVisibleText);
};

} // namespace orvex
