#pragma once

#include "modem/ModemState.h"

#include "Value.h"

namespace orvex::korat {

// Reads the modem's replies, as converted by valueFromBus(). Numbers in texts are hexadecimal. Values of an
// unexpected kind or out of range are left out.

// Puts the cells of a GetCellInfo reply into the state, each once: libmbim 1.28 repeats one neighbour in
// place of another.
void takeCells(ModemState& state, const Value& answer);

// The network location in a GetLocation reply, if any.
std::optional<Location> locationIn(const Value& answer);

// A foreign text, shortened and without control characters.
std::string textIn(const Value& value);
// A number or hexadecimal text from 0 to the maximum.
std::optional<std::int64_t> numberIn(const Value& value, std::int64_t most);
// A level in dB or dBm. None for ModemManager's placeholder for "not measured".
std::optional<double> levelIn(const Value& value);

} // namespace orvex::korat
