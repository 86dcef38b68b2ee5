#pragma once

#include <cstdint>

namespace orvex {

// The 16-bit code of a baseband packet, or kExtraCodeBase plus the 16-bit code of an extra packet.
using LogCode = std::int32_t;

// Extra packets come from the telephony service, not the baseband. Each carries a property list.
inline constexpr LogCode kExtraCodeBase = 0xFF0000;
inline constexpr LogCode kExtraCodeSimFiles = 0xFF0000;
inline constexpr LogCode kExtraCodeCellMonitorList = 0xFF0001;
inline constexpr LogCode kExtraCodePDPContexts = 0xFF0002;

} // namespace orvex
