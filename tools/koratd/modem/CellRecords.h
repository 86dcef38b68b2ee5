#pragma once

#include "modem/ModemState.h"

#include "Array.h"

namespace orvex::korat {

// The cell-monitor list of the modem's cells, with the keys of TelephonyConstants.h. Cells of 5G and CDMA
// have no records. What the modem does not tell, or what does not fit into 32 bits with sign, has no entry.
ArrayRef cellRecords(const ModemState& state);

// The SIM files that the modem tells, by the keys of TelephonyConstants.h.
DictionaryRef simFiles(const ModemState& state);

// The packet data contexts: a dictionary of rows for each connection.
ArrayRef packetDataContexts(const ModemState& state);

} // namespace orvex::korat
