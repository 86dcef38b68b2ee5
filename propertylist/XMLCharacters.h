#pragma once

#include <string>
#include <string_view>

namespace orvex {

inline bool isXMLWhiteSpace(char character)
{
    return character == ' ' || character == '\t' || character == '\r' || character == '\n';
}

// Appends the character, in UTF-8, that an XML text refers to between '&' and ';': one of the five with
// names, or a number, "#65" and "#x41". Throws PropertyListFault when there is no such character.
void appendXMLReference(std::string& text, std::string_view reference);

} // namespace orvex
