#pragma once

#include "ConsoleView.h"
#include "TerminalFrame.h"
#include "TerminalKeys.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

class ConsoleOutput;

// A terminal's screen, on which each state replaces the last. With a keyboard, arrow and Page keys scroll a
// tree taller than the screen, "/" searches it, "n" and "N" move between matches.
class TerminalView final : public ConsoleView {
public:
    struct Look {
        bool usesColour = false;
        std::function<bool()> hasKeyboard = {}; // asked before every frame; empty for none
    };

    // The output must outlive the view.
    TerminalView(ConsoleOutput& output, Look look)
        : _output(output)
        , _look(std::move(look))
    {
    }

    void show(const ConsoleState& state) override;
    // Returns false for the key that ends the program.
    bool press(const TerminalKey& key);
    // Redraws a terminal whose contents are unknown.
    void redraw();
    // Leaves the last frame on the screen and the cursor below it.
    void leave();

private:
    void draw();
    void scroll(const TerminalKey& key);
    void type(const TerminalKey& key);
    std::optional<std::size_t> nearestMatch(std::size_t start, bool isForward) const;
    void search(std::size_t start, bool isForward);
    void findNext(bool isForward);
    void endSearch();
    bool matches(std::size_t line) const;
    std::string paint(const std::string& fitted, std::size_t line) const;
    std::string footer(std::size_t height) const;

    ConsoleOutput& _output;
    Look _look;
    ConsoleState _state;
    std::vector<std::string> _lines; // of the tree
    std::vector<std::size_t> _nameEnds;
    std::size_t _first = 0; // line at the top
    bool _isClean = false;  // the screen holds our frame only

    std::string _sought;
    bool _isTyping = false; // the text to search for
    std::size_t _searchStart = 0;
    std::optional<std::size_t> _match;
};

} // namespace orvex
