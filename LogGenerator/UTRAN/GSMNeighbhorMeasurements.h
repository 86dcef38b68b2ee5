#pragma once

#include "PacketSection.h"
#include "UTRAN/LogCode_0xD00E.h"

namespace orvex {

// "GSM Neighbor Cell List": GSM neighbours seen from UTRAN. The list is built and never published: after
// the first packet the section stays empty.
class GSMNeighbhorMeasurements final : public PacketSection<LogCode_0xD00E> {
public:
    GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00E& report) override;
};

} // namespace orvex
