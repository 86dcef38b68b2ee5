#pragma once

#include "modem/ModemState.h"

#include "Value.h"

namespace orvex::korat {

// Everything the modem reports, as an IFX report: a dictionary of sections whose values are texts,
// dictionaries and arrays. The first element of an array is its heading, which IFX does not show.
Value ifxReport(const ModemState& state);

// The obstacle in the report's first row, such as "The modem is disabled". Empty if there is none.
std::string conditionLine(const ModemState& state);
// Why the report has no cells. Empty if it has, or if nobody has asked yet.
std::string cellLine(const ModemState& state);

} // namespace orvex::korat
