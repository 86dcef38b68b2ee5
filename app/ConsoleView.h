#pragma once

#include "OrvexModelNode.h"

#include <cstddef>
#include <string>

namespace orvex {

// What the console shows at one moment.
struct ConsoleState {
    std::string status; // as in the window's status line
    bool isConnected = false;
    std::string path;            // of the branch to show; "/" for the whole tree
    OrvexModelNodeRef tree = {}; // that branch; null if there is none
    std::size_t messages = 0;    // decoded so far
};

// How the console shows its state: lines, JSON or a terminal's screen.
class ConsoleView {
public:
    virtual ~ConsoleView() = default;

    virtual void show(const ConsoleState& state) = 0;
};

} // namespace orvex
