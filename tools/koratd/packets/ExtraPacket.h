#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// Extra packets come from the telephony service itself, not from the baseband: a property list in XML form
// stands behind the header. Throws std::invalid_argument when the value has no such form.
LogMessage simFilesMessage(Microseconds time, const DictionaryRef& files);
LogMessage cellMonitorMessage(Microseconds time, const ArrayRef& cells);
LogMessage pdpContextsMessage(Microseconds time, const ArrayRef& contexts);

inline constexpr LogCode kSimFilesCode = kExtraCodeBase + 0;
inline constexpr LogCode kCellMonitorCode = kExtraCodeBase + 1;
inline constexpr LogCode kPDPContextsCode = kExtraCodeBase + 2;

} // namespace orvex::korat
