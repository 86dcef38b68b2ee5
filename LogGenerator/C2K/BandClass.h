#pragma once

#include "DeferredText.h"

namespace orvex {

// The text of a CDMA2000 band class, shared by 1x and EV-DO.
DeferredText bandClassText(int bandClass);

} // namespace orvex
