#pragma once

#include "OrvexModelNode.h"

#include <cstddef>
#include <string>

namespace orvex {

// What the console shows at one moment.
struct ConsoleState {
    std::string status; // as the window's status line says it
    bool isConnected = false;
    std::string path;            // of the branch to show; "/" for the whole tree
    OrvexModelNodeRef tree = {}; // that branch; null while there is none
    std::size_t messages = 0;    // decoded so far
};

// A form in which the console writes: lines, JSON or a terminal's screen.
class ConsoleView {
public:
    virtual ~ConsoleView() = default;

    virtual void show(const ConsoleState& state) = 0;
};

} // namespace orvex
