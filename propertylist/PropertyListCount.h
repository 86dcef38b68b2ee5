#pragma once

#include "PropertyList.h"

#include <stdexcept>
#include <string>

namespace orvex {

// Why a property list cannot be read, in one line.
struct PropertyListFault : std::runtime_error {
    using std::runtime_error::runtime_error;
};

// Counts what a list becomes while it is read; throws when that exceeds a limit.
class PropertyListCount {
public:
    explicit PropertyListCount(const PropertyListLimits& limits)
        : _limits(limits)
    {
    }

    // One more value or key.
    void addNode()
    {
        if (++_nodes > _limits.maximumNodes)
            throw PropertyListFault("more than " + std::to_string(_limits.maximumNodes) + " values");
    }

    void addBytes(std::size_t bytes)
    {
        _bytes += bytes;
        if (_bytes > _limits.maximumBytes)
            throw PropertyListFault(
                "shared texts or data of more than " + std::to_string(_limits.maximumBytes) + " bytes");
    }

    // A container with so many around it.
    void enterContainer(std::size_t depth) const
    {
        if (depth >= _limits.maximumDepth)
            throw PropertyListFault(
                "nested deeper than " + std::to_string(_limits.maximumDepth) + " containers");
    }

private:
    const PropertyListLimits& _limits;
    std::size_t _nodes = 0;
    std::size_t _bytes = 0;
};

} // namespace orvex
