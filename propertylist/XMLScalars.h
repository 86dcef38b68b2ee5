#pragma once

#include "Value.h"

#include <string>
#include <string_view>

namespace orvex {

// Reads the content of an XML element without child elements: a 64-bit integer, decimal or 0x hexadecimal (a
// real if it exceeds the signed range); a real; a date such as 2026-11-16T05:54:31Z; base64 data; nothing in
// <true> and <false>; anything in <string>. White space around all but texts is ignored. Returns null if the
// content is invalid.
using XMLScalarReader = Value (*)(std::string_view content);

// Null if there is no such element.
XMLScalarReader xmlScalarReader(std::string_view element);

// Appends the bytes as padded base64.
void appendBase64(std::string& text, ByteView bytes);

} // namespace orvex
