#pragma once

#include <string>
#include <string_view>

namespace orvex {

// The text with U+FFFD for everything that XML 1.0 cannot hold: control characters other than tab and line
// breaks, and bytes that are not UTF-8. Texts come out of packets, so they may hold anything.
std::string xmlText(std::string_view text);

} // namespace orvex
