#pragma once

#include <exception>

namespace orvex {

// An indexed record at or beyond the count that its own packet carries was asked for. Nobody catches it: a
// section that does so is broken, and the process ends.
class ArrayOutOfBoundsException : public std::exception {
public:
    const char* what() const noexcept override { return "record index beyond the packet's own count"; }
};

} // namespace orvex
