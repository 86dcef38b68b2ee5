#pragma once

#include "CaptureDecoding.h"

#include <ostream>
#include <vector>

namespace orvex {

// Prints what captures hold: a table for each, with a line for each log code.
void writeSummaries(
    const std::vector<DecodedCapture>& captures, const DecodeOptions& options, std::ostream& stream);

} // namespace orvex
