#pragma once

#include "Value.h"

class QVariant;

namespace orvex::korat {

// A value from D-Bus in the one type that the rest of Orvex knows. Arrays and structures become arrays, maps
// dictionaries whose keys are texts: numbers in decimal. What has no counterpart becomes null.
Value valueFromBus(const QVariant& variant);

} // namespace orvex::korat
