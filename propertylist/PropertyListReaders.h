#pragma once

#include "PropertyList.h"

#include <span>
#include <stdexcept>
#include <string>
#include <string_view>

namespace orvex {

// Property lists count dates from 2001-01-01 00:00:00 UTC.
inline constexpr double kPropertyListEpoch = 978'307'200; // seconds since 1970

// Why a property list cannot be read, in one line.
struct PropertyListFault : std::runtime_error {
    using std::runtime_error::runtime_error;
};

// Counts values and containers while a list is read. Throws if a limit is exceeded.
class PropertyListCount {
public:
    explicit PropertyListCount(const PropertyListLimits& limits)
        : _limits(limits)
    {
    }

    void addNode()
    {
        if (++_nodes > _limits.maximumNodes)
            throw tooManyNodes(_limits);
    }

    void addBytes(std::size_t bytes)
    {
        _bytes += bytes;
        if (_bytes > _limits.maximumBytes)
            throw PropertyListFault(
                "shared texts or data of more than " + std::to_string(_limits.maximumBytes) + " bytes");
    }

    // The depth is the number of containers around this one.
    void enterContainer(std::size_t depth) const
    {
        if (depth >= _limits.maximumDepth)
            throw PropertyListFault(
                "nested deeper than " + std::to_string(_limits.maximumDepth) + " containers");
    }

    static PropertyListFault tooManyNodes(const PropertyListLimits& limits)
    {
        PropertyListFault fault("more than " + std::to_string(limits.maximumNodes) + " values");
        return fault;
    }

private:
    const PropertyListLimits& _limits;
    std::size_t _nodes = 0;
    std::size_t _bytes = 0;
};

// Reads the XML form. Throws PropertyListFault unless the list is within its limits and well formed: known
// elements, one value in <plist>, keys and values in turn, valid numbers, dates and data. A document type may
// not declare anything, so no entity expands. Of two entries with the same key the last one counts.
//
// The parser overwrites the list, which must end with kXMLPadding: the parser puts a zero in the place of the
// last byte and misses a '<' before it.
inline constexpr std::string_view kXMLPadding = "\n\n";
Value readXMLPropertyList(Bytes&& paddedList, const PropertyListLimits& limits);

// Reads the binary form. Throws PropertyListFault unless every object reachable from the root lies inside the
// list and the tree is within the limits. A shared object becomes a value of its own at each reference, and
// it and its bytes count each time. A list whose values outnumber its bytes, which takes shared containers,
// or whose values would take far more memory than the list, is refused before memory is spent.
//
//    0              "bplist00", the last two characters the version
//    8              objects: a marker byte (kind in the high half, size in the low one) and content
//   offset table    offset of each object, of offsetSize bytes
//   last 32 bytes   6 u8   offsetSize
//                   7 u8   size of a reference to an object
//                   8 u64  number of objects
//                  16 u64  number of the root object
//                  24 u64  where the offset table starts
//
// All numbers are big-endian. An array holds references to its elements, a dictionary references to all keys,
// then to all values. Integers of up to four bytes are unsigned, those of eight signed; those of sixteen
// become reals. Dictionary entries whose keys are not texts are left out.
Value readBinaryPropertyList(ByteView list, const PropertyListLimits& limits);

} // namespace orvex
