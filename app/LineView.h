#pragma once

#include "ConsoleView.h"

namespace orvex {

class ConsoleOutput;

// Plain lines for files and other programs: the status, then the tree if there is a session. A blank line
// separates one state from the next.
class LineView final : public ConsoleView {
public:
    // The output must outlive the view.
    LineView(ConsoleOutput& output, bool usesColour)
        : _output(output)
        , _usesColour(usesColour)
    {
    }

    void show(const ConsoleState& state) override;

private:
    ConsoleOutput& _output;
    bool _usesColour;
    bool _wroteBefore = false;
};

} // namespace orvex
