#pragma once

#include <string>
#include <string_view>

namespace orvex {

inline bool isXMLWhiteSpace(char character)
{
    return character == ' ' || character == '\t' || character == '\r' || character == '\n';
}

// The text with U+FFFD for everything that XML 1.0 cannot hold: control characters other than tab and line
// breaks, and bytes that are not UTF-8. Texts come out of packets, so they may hold anything.
std::string xmlText(std::string_view text);

// Appends what a text of an XML document says, with the characters for the references to them: "&amp;" and
// the other four with names, or a number, "&#65;" and "&#x41;". Throws PropertyListFault where one is
// malformed or there is no such character.
void appendXMLText(std::string& text, std::string_view raw);

} // namespace orvex
