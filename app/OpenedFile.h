#pragma once

#include "LogGenerator.h"
#include "OrvexModelNode.h"

#include <string>

namespace orvex {

// The contents of a snapshot or capture.
struct OpenedFile {
    OrvexModelNodeRef tree; // null if the file cannot be read
    std::string status;     // for the status line
    std::string error;      // why there is no tree, in one line with the path
};

// Reads a snapshot, or decodes a capture with the technology guessed from its messages. A message that is
// fatal by design ends the process here too.
OpenedFile openFile(const std::string& path, const GeneratorEnvironment& environment);

} // namespace orvex
