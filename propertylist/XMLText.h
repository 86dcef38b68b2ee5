#pragma once

#include <string>
#include <string_view>

namespace orvex {

inline bool isXMLWhiteSpace(char character)
{
    return character == ' ' || character == '\t' || character == '\r' || character == '\n';
}

// The text with U+FFFD for everything that XML 1.0 cannot hold: control characters other than tab and line
// breaks, and invalid UTF-8. Texts come from packets, so they may hold anything.
std::string xmlText(std::string_view text);

// Appends the text of an XML document with its character references resolved: "&amp;" and the other four
// names, "&#65;" and "&#x41;". Throws PropertyListFault if one is malformed or names no character.
void appendXMLText(std::string& text, std::string_view raw);

} // namespace orvex
