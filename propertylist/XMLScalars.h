#pragma once

#include "Value.h"

#include <string>
#include <string_view>

namespace orvex {

// How the content of an XML element that holds no others is read: an integer of 64 bits with or without sign,
// decimal or 0x hexadecimal (a real when it exceeds the signed ones); a real; a date as 2026-11-16T05:54:31Z;
// base64 data; nothing in <true> and <false>; anything in <string>. White space around all but texts does not
// count. The reader gives null when the content is not what the element promises.
using XMLScalarReader = Value (*)(std::string_view content);

// Null when there is no such element.
XMLScalarReader xmlScalarReader(std::string_view element);

// Appends the bytes in base64, padded.
void appendBase64(std::string& text, ByteView bytes);

} // namespace orvex
