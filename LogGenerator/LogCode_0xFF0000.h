#pragma once

#include "PacketReader.h"

#include "Dictionary.h"

namespace orvex {

// SIM files, as the telephony service reports them: a property list with one dictionary from byte 13 on.
class LogCode_0xFF0000 {
public:
    // There is no such dictionary. Nobody catches it.
    class UnknownDataException { };

    explicit LogCode_0xFF0000(Packet packet)
        : _packet(packet)
    {
    }

    // Throws UnknownDataException, after a log line.
    DictionaryRef files() const;

private:
    PacketReader _packet;
};

} // namespace orvex
