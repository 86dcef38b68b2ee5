#pragma once

#include "Value.h"

#include <string>
#include <vector>

namespace orvex {

struct DictionaryResult {
    DictionaryRef dictionary;
    std::string error; // which file and why, in one line, when there is no dictionary
};

// The application's resources of type "plist". Nothing is logged here: whoever asks decides what to say.
class Resources {
public:
    virtual ~Resources() = default;

    // The file names of all of them, relative to where resources are kept, sorted. None when that place
    // cannot be read.
    virtual std::vector<std::string> propertyListPaths() const = 0;
    // The dictionary in the resource of that base name; null when it is missing, is no property list or
    // holds something else.
    virtual DictionaryResult dictionaryNamed(const std::string& baseName) const = 0;
};

} // namespace orvex
