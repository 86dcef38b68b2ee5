#pragma once

#include "PropertyList.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>

namespace orvex {

// Walks the objects of a binary property list before the parser sees it. Gives the fault in one line; none
// when every object that the root reaches lies inside the list and the tree, with shared objects counted
// wherever they appear, keeps the limits. The limit of bytes holds for texts and data of that tree too, as
// each appearance becomes a copy.
//
//    0              "bplist" and two characters of version
//    8              objects: a marker byte (kind in the high half, size in the low one) and content
//   offset table    offset of each object, of offsetSize bytes
//   last 32 bytes   6 u8   offsetSize
//                   7 u8   size of a reference to an object
//                   8 u64  number of objects
//                  16 u64  number of the root object
//                  24 u64  where the offset table starts
//
// All numbers are big-endian. An array is followed by references to its elements, a dictionary by those to
// all keys, then those to all values.
std::optional<std::string> faultOfBinaryPropertyList(
    std::span<const std::uint8_t> list, const PropertyListLimits& limits);

} // namespace orvex
