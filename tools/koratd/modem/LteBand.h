#pragma once

#include <cstdint>
#include <optional>

namespace orvex::korat {

// The frequency band of a downlink EARFCN (3GPP TS 36.101, table 5.7.3-1). None between bands.
std::optional<int> lteBandOf(std::int64_t earfcn);

} // namespace orvex::korat
