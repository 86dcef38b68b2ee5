#pragma once

#include "LateText.h"

namespace orvex {

// The text of a CDMA2000 band class, shared by 1x and EV-DO.
LateText bandClassText(int bandClass);

} // namespace orvex
