#pragma once

#include "modem/ModemState.h"

#include "Value.h"

namespace orvex::korat {

// The answers of ModemManager's modem, as valueFromBus() gives them. Texts of numbers are hexadecimal. What
// is not of the expected kind, no number or no possible one, is left out.

// Puts the cells of an answer to GetCellInfo into the state, each once: libmbim 1.28 repeats one neighbour in
// the place of another.
void takeCells(ModemState& state, const Value& answer);

// The network's location in an answer to GetLocation. None when there is none.
std::optional<Location> locationIn(const Value& answer);

// A text from outside, shortened and without control characters.
std::string textIn(const Value& value);
// A number, or a hexadecimal text, from 0 to the most.
std::optional<std::int64_t> numberIn(const Value& value, std::int64_t most);
// A level in dB or dBm. None for what ModemManager writes where nothing was measured.
std::optional<double> levelIn(const Value& value);

} // namespace orvex::korat
