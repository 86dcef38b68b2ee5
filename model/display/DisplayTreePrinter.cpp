#include "DisplayTreePrinter.h"

namespace orvex {

namespace {

constexpr std::size_t kIndent = 2;

void appendLines(std::vector<DisplayTreePrinter::Line>& lines, const OrvexModelNode& node, std::size_t depth,
    std::size_t longest)
{
    std::string line(depth * kIndent, ' ');
    line += visibleText(node.displayName(), longest);
    const std::size_t nameEnd = line.size();
    if (const std::string* value = node.value()) {
        line += value->empty() ? ":" : ": ";
        line += visibleText(*value, longest);
    }
    lines.push_back({std::move(line), nameEnd});
    if (const auto* children = node.childNodes()) {
        for (const OrvexModelNodeRef& child : *children)
            appendLines(lines, *child, depth + 1, longest);
    }
}

} // namespace

std::vector<DisplayTreePrinter::Line> DisplayTreePrinter::lines(
    const OrvexModelNode& root, std::size_t longest)
{
    std::vector<Line> result;
    appendLines(result, root, 0, longest);
    return result;
}

std::string DisplayTreePrinter::text(const OrvexModelNode& root, std::size_t longest)
{
    std::string result;
    for (const Line& line : lines(root, longest)) {
        result += line.text;
        result += '\n';
    }
    return result;
}

} // namespace orvex
