#pragma once

namespace orvex::korat {

// Writes a line for whoever runs the service to standard error, after "koratd: ".
[[gnu::format(printf, 1, 2)]] void report(const char* format, ...);

} // namespace orvex::korat
