#pragma once

#include "modem/ModemState.h"

#include "Array.h"

namespace orvex::korat {

// The modem's cells as a cell-monitor list, with the keys of TelephonyConstants.h. 5G and CDMA cells have no
// records. Values that the modem does not report, or that exceed a signed 32-bit integer, have no entry.
ArrayRef cellRecords(const ModemState& state);

// The SIM files that the modem reports, by the keys of TelephonyConstants.h.
DictionaryRef simFiles(const ModemState& state);

// The packet data contexts: a dictionary of rows for each connection.
ArrayRef packetDataContexts(const ModemState& state);

} // namespace orvex::korat
