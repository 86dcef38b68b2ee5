#pragma once

#include "Value.h"

class QVariant;

namespace orvex::korat {

// Converts a D-Bus value. Arrays and structures become arrays; maps become dictionaries, numeric keys as
// decimal texts. A value without a counterpart becomes null.
Value valueFromBus(const QVariant& variant);

} // namespace orvex::korat
