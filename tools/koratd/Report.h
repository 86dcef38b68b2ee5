#pragma once

#include "TextFormat.h"
#include "VisibleText.h"

#include <cstdio>

namespace orvex::korat {

// Writes a line for whoever runs the service to standard error, after "koratd: ".
inline void reportText(const std::string& text)
{
    const std::string line = "koratd: " + visibleText(text) + '\n';
    // One call, so that lines of several processes on one terminal stay whole.
    std::fwrite(line.data(), 1, line.size(), stderr);
}

// The same with a line made by a printf format.
template <typename... Arguments>
void report(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    reportText(text(format, arguments...));
}

} // namespace orvex::korat
