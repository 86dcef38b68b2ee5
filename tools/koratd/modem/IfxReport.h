#pragma once

#include "modem/ModemState.h"

#include "Value.h"

namespace orvex::korat {

// All that the modem says, as a report of IFX: a dictionary of sections whose values are texts, dictionaries
// and arrays. The first element of an array is its heading, which IFX does not show.
Value ifxReport(const ModemState& state);

// What stands in the way, as the first row of the report: "The modem is disabled". Empty when nothing does.
std::string conditionLine(const ModemState& state);
// Why there are no cells, as a row of the report; empty when there are, or nobody has asked yet.
std::string cellLine(const ModemState& state);

} // namespace orvex::korat
