#pragma once

#include "Value.h"

#include <string>

namespace orvex {

// Preferences that belong to another application.
class Preferences {
public:
    virtual ~Preferences() = default;

    virtual void setValue(const std::string& domain, const std::string& key, const Value& value) = 0;
    // Brings what was set to storage.
    virtual void synchronize(const std::string& domain) = 0;
    // Tells every application that a preference has changed.
    virtual void postChanged(const std::string& domain, const std::string& key) = 0;
};

} // namespace orvex
