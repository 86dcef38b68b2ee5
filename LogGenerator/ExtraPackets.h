#pragma once

#include "Base.h"
#include "PacketReader.h"

#include "Dictionary.h"
#include "PropertyList.h"

#include <stdexcept>

namespace orvex {

// The property list in an extra packet, from byte 13 on.
//
// Several sections take the same extra packet in turn, and parsing it costs more than everything else done
// with it, so the last packet's list is kept (per thread). The sections share it: none of them may change
// it. The reference is valid until the next call.
const PropertyListResult& propertyListOf(Packet packet);

// SIM files, as the telephony service reports them: a property list with one dictionary from byte 13 on.
class LogCode_0xFF0000 {
public:
    // There is no such dictionary. Never caught.
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

// "SIM Info": the SIM's elementary files (3GPP TS 31.102, clause 4.2), each as the telephony service
// forwards it.
class SimInfo final : public Base {
public:
    SimInfo(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

// "PDP Context Info": the packet data contexts (extra code 0xFF0002), a property list with an array from
// byte 13 on. The contents of a context are up to the telephony service and are shown as they are. A
// property list of another kind is dropped silently.
class PDPContextList final : public Base {
public:
    // There is no property list at all. Never caught.
    class UnknownDataException : public std::runtime_error {
    public:
        using std::runtime_error::runtime_error;
    };

    PDPContextList(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
