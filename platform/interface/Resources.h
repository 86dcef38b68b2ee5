#pragma once

#include "Value.h"

#include <string>
#include <vector>

namespace orvex {

// The application's resources of type "plist".
class Resources {
public:
    virtual ~Resources() = default;

    // The file names of all of them, relative to where resources are kept, sorted.
    virtual std::vector<std::string> propertyListPaths() const = 0;
    // The dictionary in the resource of that base name; null when it is missing, is no property list or
    // holds something else. Why is said in the system log.
    virtual DictionaryRef dictionaryNamed(const std::string& baseName) const = 0;
};

} // namespace orvex
