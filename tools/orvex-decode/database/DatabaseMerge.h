#pragma once

#include "DecodeOptions.h"

namespace orvex {

// Adds the captures of the input databases to the timeline's. Returns false, after error lines, when that did
// not go well for all of them.
bool mergeDatabases(const DecodeOptions& options);

} // namespace orvex
