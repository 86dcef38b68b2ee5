#pragma once

#include "PacketReader.h"

#include "PropertyList.h"

namespace orvex {

// The property list that an extra packet carries from byte 13 on.
//
// Several sections take the same extra packet, one after another. The list of the last packet is kept (one
// per thread), so that all of them see one and none of them changes it; reading it costs more than all the
// rest of a packet's way. The reference holds until the next call.
const PropertyListResult& propertyListOf(Packet packet);

} // namespace orvex
