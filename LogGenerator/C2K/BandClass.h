#pragma once

#include <string>

namespace orvex {

// The text of a CDMA2000 band class, shared by 1x and EV-DO.
std::string bandClassText(int bandClass);

} // namespace orvex
