#include "TerminalFrame.h"

#include "TextFormat.h"

#include <QList>
#include <QString>

#include <algorithm>
#include <cwchar>
#include <utility>

namespace orvex {

namespace {

constexpr int kNarrowestColumn = 46;
constexpr int kColumnGap = 2;
constexpr int kLinesBesidesBody = 2; // the status line and the cursor's line

// Wide characters take two cells, combining ones none.
int cellsOf(char32_t character)
{
    const int cells = ::wcwidth(static_cast<wchar_t>(character));
    return cells < 0 ? 1 : cells;
}

// The columns of the body.
struct Grid {
    Grid(std::size_t bodyLines, TerminalSize size)
        : height(static_cast<std::size_t>(std::max(1, size.rows - kLinesBesidesBody)))
    {
        const std::size_t wanted = (bodyLines + height - 1) / height;
        const int possible = std::max(1, (size.columns + kColumnGap) / (kNarrowestColumn + kColumnGap));
        columns = std::clamp<std::size_t>(wanted, 1, static_cast<std::size_t>(possible));
        width = (size.columns + kColumnGap) / static_cast<int>(columns) - kColumnGap;
    }
    std::size_t capacity() const { return height * columns; }

    std::size_t height;
    std::size_t columns;
    int width;
};

} // namespace

std::string fittedToCells(const std::string& text, int cells, bool padded)
{
    const auto characters = QString::fromStdString(text).toUcs4();
    int needed = 0;
    for (const auto character : characters)
        needed += cellsOf(character);

    QString result;
    int used = 0;
    const int room = needed > cells ? cells - 1 : cells; // a cell for the ellipsis
    for (const auto character : characters) {
        if (used + cellsOf(character) > room)
            break;
        result += QString::fromUcs4(reinterpret_cast<const char32_t*>(&character), 1);
        used += cellsOf(character);
    }
    if (needed > cells && cells > 0) {
        result += QChar(0x2026);
        ++used;
    }
    if (padded)
        result += QString(std::max(0, cells - used), QLatin1Char(' '));
    return result.toStdString();
}

std::size_t linesInFrame(std::size_t bodyLines, TerminalSize size)
{
    return Grid(bodyLines, size).capacity();
}

std::vector<std::string> terminalFrame(
    const std::string& status, const std::vector<std::string>& body, TerminalSize size, const FrameLook& look)
{
    const Grid grid(body.size(), size);
    const std::size_t first = std::min(look.firstLine.value_or(0), body.size());
    const std::size_t shown = std::min(body.size() - first, grid.capacity());
    const bool saysMissing = !look.firstLine && shown < body.size();

    const auto line = [&](std::size_t index, bool padded) {
        if (saysMissing && index == shown - 1)
            return fittedToCells(text("... %zu more lines", body.size() - index), grid.width, padded);
        const std::string fitted = fittedToCells(body[first + index], grid.width, padded);
        return look.paint ? look.paint(fitted, first + index) : fitted;
    };
    std::vector<std::string> frame{fittedToCells(status, size.columns, false)};
    for (std::size_t row = 0; row < std::min(grid.height, shown); ++row) {
        std::string joined;
        for (std::size_t index = row; index < shown; index += grid.height) {
            const bool isLast = index + grid.height >= shown;
            joined += line(index, !isLast);
            if (!isLast)
                joined += std::string(kColumnGap, ' ');
        }
        frame.push_back(std::move(joined));
    }
    return frame;
}

} // namespace orvex
