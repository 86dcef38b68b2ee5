#include "LineView.h"

#include "ConsoleColours.h"
#include "ConsoleOutput.h"

#include "DisplayTreePrinter.h"

#include <utility>

namespace orvex {

void LineView::show(const ConsoleState& state)
{
    std::string text = std::exchange(_wroteBefore, true) ? "\n" : "";
    text += (_usesColour ? colouredStatus(state.status, state.isConnected) : state.status) + '\n';
    if (state.isConnected && state.tree) {
        for (const DisplayTreePrinter::Line& line : DisplayTreePrinter::lines(*state.tree))
            text += (_usesColour ? colouredLine(line.text, line.nameEnd) : line.text) + '\n';
    } else if (state.isConnected) {
        text += nothingAt(state.path) + '\n';
    }
    _output.write(text);
}

} // namespace orvex
