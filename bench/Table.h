#pragma once

#include "Results.h"

namespace orvex::bench {

// The table of all figures that were measured, in Markdown: absolute, as ratios to the floors of the same
// run, and beside their bounds.
std::string markdownTable(const Results& results);

} // namespace orvex::bench
