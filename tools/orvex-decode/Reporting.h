#pragma once

#include "DecodeOptions.h"

#include <functional>
#include <ostream>
#include <string>
#include <string_view>

namespace orvex {

// What the decoder says and writes. All return whether it is well.

// One line on standard error. False, always.
bool printError(const std::string& message);
// Replaces the file.
bool writeFile(const std::string& path, std::string_view content);
// Where the options want the document to go.
bool printDocument(const std::function<void(std::ostream&)>& write, const DecodeOptions& options);

} // namespace orvex
