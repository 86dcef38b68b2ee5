#pragma once

#include "TextFormat.h"

namespace orvex::korat {

// Writes a line for whoever runs the service to standard error, after "koratd: ".
void reportText(const std::string& text);

// The same with a line made by a printf format.
template <typename... Arguments>
void report(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    reportText(text(format, arguments...));
}

} // namespace orvex::korat
