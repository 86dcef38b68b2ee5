#pragma once

#include "LogGenerator.h"

#include <string>

namespace orvex {

// The technology whose start command asks for most of the capture's first messages; IFX for a capture that
// begins with a property list; empty when there is none.
std::string technologyOfCapture(const std::string& path, const GeneratorEnvironment& environment);

} // namespace orvex
