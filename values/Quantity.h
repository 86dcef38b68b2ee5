#pragma once

#include <optional>
#include <string_view>

namespace orvex {

// A measured value: "-75.50 dBm" is -75.5 and "dBm".
struct Quantity {
    double number = 0;
    std::string_view unit; // as the text has it; valid for the whole run
};

// The quantity that a row shows: a finite decimal number, a blank or nothing, and one of the units that rows
// have. None for anything else: identities and counts ("310", "0x1A"), ranges ("0 to 9"), values with a
// remark ("0.50% (old)").
std::optional<Quantity> quantityOf(std::string_view text);

} // namespace orvex
