#include "DisplayTreePrinter.h"

#include "TextFormat.h"

#include <string_view>

namespace orvex {

namespace {

constexpr std::size_t kIndent = 2;

// In UTF-8 the control characters from U+0080 on are two bytes, of which this is the first.
constexpr unsigned char kUpperControlsLead = 0xC2;

void appendVisibly(std::string& line, std::string_view text)
{
    for (std::size_t i = 0; i < text.size(); ++i) {
        const auto byte = static_cast<unsigned char>(text[i]);
        const auto next = i + 1 < text.size() ? static_cast<unsigned char>(text[i + 1]) : 0U;
        if (byte == '\n') {
            line += "\\n";
        } else if (byte == '\t') {
            line += "\\t";
        } else if (byte < 0x20 || byte == 0x7F) {
            line += orvex::text("\\x%02x", byte);
        } else if (byte == kUpperControlsLead && next >= 0x80 && next < 0xA0) {
            line += orvex::text("\\x%02x", next);
            ++i;
        } else {
            line += text[i];
        }
    }
}

void appendLines(std::vector<std::string>& lines, const OrvexModelNode& node, std::size_t depth)
{
    std::string line(depth * kIndent, ' ');
    appendVisibly(line, node.displayName());
    if (const std::string* value = node.value()) {
        line += value->empty() ? ":" : ": ";
        appendVisibly(line, *value);
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
