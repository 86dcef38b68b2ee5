#include "DisplayTreePrinter.h"

#include "VisibleText.h"

namespace orvex {

namespace {

constexpr std::size_t kIndent = 2;

void appendLines(std::vector<std::string>& lines, const OrvexModelNode& node, std::size_t depth)
{
    std::string line(depth * kIndent, ' ');
    line += visibleText(node.displayName());
    if (const std::string* value = node.value()) {
        line += value->empty() ? ":" : ": ";
        line += visibleText(*value);
    }
    lines.push_back(std::move(line));
    if (const auto* children = node.childNodes()) {
        for (const OrvexModelNodeRef& child : *children)
            appendLines(lines, *child, depth + 1);
    }
}

} // namespace

std::vector<std::string> DisplayTreePrinter::lines(const OrvexModelNode& root)
{
    std::vector<std::string> result;
    appendLines(result, root, 0);
    return result;
}

std::string DisplayTreePrinter::text(const OrvexModelNode& root)
{
    std::string result;
    for (const std::string& line : lines(root)) {
        result += line;
        result += '\n';
    }
    return result;
}

} // namespace orvex
