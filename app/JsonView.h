#pragma once

#include "ConsoleView.h"

namespace orvex {

class ConsoleOutput;

// One JSON object per line, for programs that follow a session:
//
//   "schema"     1
//   "status"     text     as in the window's status line
//   "connected"  boolean
//   "messages"   number   decoded so far
//   "tree"       object   by writeTreeJson(); null if there is none
class JsonView final : public ConsoleView {
public:
    // The output must outlive the view.
    explicit JsonView(ConsoleOutput& output)
        : _output(output)
    {
    }

    void show(const ConsoleState& state) override;

private:
    ConsoleOutput& _output;
};

} // namespace orvex
