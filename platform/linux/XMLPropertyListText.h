#pragma once

#include <string_view>

namespace orvex {

enum class XMLPropertyListText { good, malformed, unknownElement };

// Whether the content of an element of an XML property list that holds no others can be read as what the
// element promises: an integer of 64 bits with or without sign, decimal or 0x hexadecimal; a real; a date as
// 2026-11-16T05:54:31Z; base64 data; nothing in <true> and <false>; anything in <string> and <key>. The
// parser itself makes 0 of a number that it cannot read.
XMLPropertyListText checkXMLPropertyListText(std::string_view element, std::string_view content);

} // namespace orvex
