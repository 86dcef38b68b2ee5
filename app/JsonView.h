#pragma once

#include "ConsoleView.h"

namespace orvex {

class ConsoleOutput;

// One JSON object a line, for programs that follow a session:
//
//   "schema"     1
//   "status"     text     as the window's status line says it
//   "connected"  boolean
//   "messages"   number   decoded so far
//   "tree"       object   as writeTreeJson() writes it; null while there is none
class JsonView final : public ConsoleView {
public:
    // The output outlives the view.
    explicit JsonView(ConsoleOutput& output)
        : _output(output)
    {
    }

    void show(const ConsoleState& state) override;

private:
    ConsoleOutput& _output;
};

} // namespace orvex
