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

// Counts what a list becomes while it is read; throws when that exceeds a limit.
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
        return PropertyListFault("more than " + std::to_string(limits.maximumNodes) + " values");
    }

private:
    const PropertyListLimits& _limits;
    std::size_t _nodes = 0;
    std::size_t _bytes = 0;
};

// Reads the XML form. Throws PropertyListFault unless the list keeps its limits and is well formed: known
// elements, one value in <plist>, keys and values in turn, numbers, dates and data that can be read. A
// document type may not declare anything, so no entity grows. Of two entries with one key the last counts.
//
// The parser overwrites the list, which ends with kXMLPadding: it puts a zero in the place of the last byte
// and overlooks a '<' before that.
inline constexpr std::string_view kXMLPadding = "\n\n";
Value readXMLPropertyList(Bytes&& paddedList, const PropertyListLimits& limits);

// Reads the binary form. Throws PropertyListFault unless every object that the root reaches lies inside the
// list and the tree keeps the limits. An object may be referred to many times; each time it becomes a value
// of its own and counts as one, as the bytes of texts and data do. Before memory is spent, a list is refused
// whose values outnumber its bytes, which takes shared containers, or would take far more memory than bytes.
//
//    0              "bplist00", of which the last two are the version
//    8              objects: a marker byte (kind in the high half, size in the low one) and content
//   offset table    offset of each object, of offsetSize bytes
//   last 32 bytes   6 u8   offsetSize
//                   7 u8   size of a reference to an object
//                   8 u64  number of objects
//                  16 u64  number of the root object
//                  24 u64  where the offset table starts
//
// All numbers are big-endian. An array is followed by references to its elements, a dictionary by those to
// all keys, then those to all values. Integers of up to four bytes have no sign, those of eight have one,
// those of sixteen hold what is too large for that and become reals. A dictionary leaves out what stands
// under a key that is no text.
Value readBinaryPropertyList(ByteView list, const PropertyListLimits& limits);

} // namespace orvex
