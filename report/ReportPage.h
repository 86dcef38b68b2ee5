#pragma once

#include "TreeJson.h"

#include <functional>
#include <ostream>

namespace orvex {

// Writes the page of a report, which holds its scripts, its styles and its data and loads nothing.
// `writeData` writes the one value that the scripts read. The page's policy allows these very scripts and
// styles only, by their hashes.
void writeReportPage(std::ostream& stream, const std::function<void(JsonWriter&)>& writeData);

} // namespace orvex
