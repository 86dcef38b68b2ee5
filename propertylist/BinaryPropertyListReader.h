#pragma once

#include "PropertyList.h"

#include <cstdint>
#include <span>

namespace orvex {

// Reads a property list in its binary form. Throws PropertyListFault unless every object that the root
// reaches lies inside the list and the tree keeps the limits. An object may be referred to many times; each
// time it becomes a value of its own and counts as one, as the bytes of texts and data do. Before memory is
// spent, a list is refused whose values outnumber its bytes, which takes shared containers, or would take far
// more memory than bytes.
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
Value readBinaryPropertyList(std::span<const std::uint8_t> list, const PropertyListLimits& limits);

} // namespace orvex
