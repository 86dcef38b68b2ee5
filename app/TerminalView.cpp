#include "TerminalView.h"

#include "ConsoleColours.h"
#include "ConsoleOutput.h"

#include "DisplayTreePrinter.h"
#include "TextFormat.h"

#include <QString>

#include <algorithm>
#include <limits>
#include <utility>

namespace orvex {

namespace {

using Code = TerminalKey::Code;

constexpr const char* kClearScreen = "\x1b[2J";
constexpr const char* kCursorHome = "\x1b[H";
constexpr const char* kClearLineEnd = "\x1b[K";
constexpr const char* kClearBelow = "\x1b[J";

void dropLastCharacter(std::string& text)
{
    QString characters = QString::fromStdString(text);
    characters.chop(1);
    text = characters.toStdString();
}

// Letters do what keys do, as in a pager.
Code movementOf(const TerminalKey& key)
{
    if (key.code != Code::text)
        return key.code;
    if (key.text == "j")
        return Code::down;
    if (key.text == "k")
        return Code::up;
    if (key.text == " ")
        return Code::pageDown;
    if (key.text == "b")
        return Code::pageUp;
    if (key.text == "g")
        return Code::home;
    return key.text == "G" ? Code::end : Code::other;
}

} // namespace

void TerminalView::show(const ConsoleState& state)
{
    _state = state;
    _lines.clear();
    _nameEnds.clear();
    if (state.tree) {
        for (DisplayTreePrinter::Line& line : DisplayTreePrinter::lines(*state.tree)) {
            _lines.push_back(std::move(line.text));
            _nameEnds.push_back(line.nameEnd);
        }
    } else if (state.isConnected) {
        _lines.push_back(nothingAt(state.path));
        _nameEnds.push_back(0);
    }
    if (!_sought.empty())
        _match = nearestMatch(_match.value_or(_first), true); // rows have come or gone
    draw();
}

bool TerminalView::press(const TerminalKey& key)
{
    if (key.code == Code::redraw) {
        redraw();
        return true;
    }
    if (_isTyping)
        type(key);
    else if (key.text == "q")
        return false;
    else if (key.text == "/") {
        _isTyping = true;
        _sought.clear();
        _match.reset();
        _searchStart = _first;
    } else if (key.text == "n" || key.text == "N")
        findNext(key.text == "n");
    else if (key.code == Code::escape)
        endSearch();
    else
        scroll(key);
    draw();
    return true;
}

void TerminalView::redraw()
{
    _isClean = false;
    draw();
}

void TerminalView::leave()
{
    _output.write(std::string("\r") + kClearLineEnd);
}

void TerminalView::scroll(const TerminalKey& key)
{
    const auto size = _output.terminalSize().value_or(TerminalSize{});
    const std::size_t height = linesInFrame(_lines.size(), size);
    const std::size_t page = std::max<std::size_t>(height, 2) - 1;
    switch (movementOf(key)) {
    case Code::up: _first -= std::min<std::size_t>(_first, 1); break;
    case Code::down: ++_first; break;
    case Code::pageUp: _first -= std::min(_first, page); break;
    case Code::pageDown: _first += page; break;
    case Code::home: _first = 0; break;
    case Code::end: _first = _lines.size(); break;
    default: break;
    }
}

void TerminalView::type(const TerminalKey& key)
{
    switch (key.code) {
    case Code::text: _sought += key.text; break;
    case Code::backspace: dropLastCharacter(_sought); break;
    case Code::enter: _isTyping = false; break;
    case Code::escape: endSearch(); break;
    default: return;
    }
    if (!_isTyping)
        return;
    _first = _searchStart;
    search(_searchStart, true);
}

void TerminalView::endSearch()
{
    _isTyping = false;
    _sought.clear();
    _match.reset();
}

bool TerminalView::matches(std::size_t line) const
{
    return QString::fromStdString(_lines[line])
        .contains(QString::fromStdString(_sought), Qt::CaseInsensitive);
}

// The match at the line or nearest in that direction, around the end of the tree.
std::optional<std::size_t> TerminalView::nearestMatch(std::size_t start, bool isForward) const
{
    const std::size_t count = _lines.size();
    for (std::size_t step = 0; step < count && !_sought.empty(); ++step) {
        const std::size_t line = (std::min(start, count - 1) + (isForward ? step : count - step)) % count;
        if (matches(line))
            return line;
    }
    return std::nullopt;
}

void TerminalView::search(std::size_t start, bool isForward)
{
    _match = nearestMatch(start, isForward);
    const auto size = _output.terminalSize().value_or(TerminalSize{});
    const std::size_t height = linesInFrame(_lines.size(), size);
    if (_match && (*_match < _first || *_match >= _first + height))
        _first = *_match - std::min(*_match, height / 3);
}

void TerminalView::findNext(bool isForward)
{
    if (_lines.empty())
        return;
    const std::size_t from = _match.value_or(_first);
    search((from + (isForward ? 1 : _lines.size() - 1)) % _lines.size(), isForward);
}

std::string TerminalView::paint(const std::string& fitted, std::size_t line) const
{
    if (line == _match)
        return highlightedLine(fitted);
    return _look.usesColour ? colouredLine(fitted, _nameEnds[line]) : fitted;
}

std::string TerminalView::footer(std::size_t height) const
{
    if (_isTyping)
        return '/' + _sought;
    if (!_sought.empty() && !_match)
        return "No line has '" + _sought + "'.";
    if (!_sought.empty())
        return "'" + _sought + "': n goes to the next line, N to the one before, Esc ends the search";
    if (_lines.size() <= height)
        return "/ searches, q ends";
    return text("Lines %zu to %zu of %zu; arrow and Page keys scroll, / searches, q ends", _first + 1,
        std::min(_first + height, _lines.size()), _lines.size());
}

void TerminalView::draw()
{
    const TerminalSize size = _output.terminalSize().value_or(TerminalSize{});
    const bool hasKeyboard = _look.hasKeyboard && _look.hasKeyboard();
    const std::size_t height = linesInFrame(_lines.size(), size);
    _first = std::min(_first, _lines.size() - std::min(height, _lines.size()));

    FrameLook look{
        .paint = [this](const std::string& fitted, std::size_t line) { return paint(fitted, line); }};
    if (hasKeyboard)
        look.firstLine = _first;
    std::vector<std::string> frame = terminalFrame(_state.status, _lines, size, look);
    if (_look.usesColour)
        frame.front() = colouredStatus(frame.front(), _state.isConnected);
    // Overwritten rather than cleared first, which would flicker.
    std::string text = kCursorHome;
    text += std::exchange(_isClean, true) ? "" : kClearScreen;
    for (const std::string& line : frame)
        text += line + kClearLineEnd + '\n';
    text += kClearBelow;
    if (hasKeyboard)
        text += fittedToCells(footer(height), size.columns - 1, false);
    _output.write(text);
}

} // namespace orvex
