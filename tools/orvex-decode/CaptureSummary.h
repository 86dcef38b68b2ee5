#pragma once

#include "CaptureDecoding.h"

#include "TreeJson.h"

#include <ostream>
#include <vector>

namespace orvex {

// Prints what captures hold: a table for each, with a line for each log code.
void writeSummaries(
    const std::vector<DecodedCapture>& captures, const DecodeOptions& options, std::ostream& stream);

// The table of one capture, as a JSON array.
void writeSummaryJson(JsonWriter& json, const CaptureCounts& counts);

} // namespace orvex
