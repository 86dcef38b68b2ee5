#pragma once

#include "Base.h"

namespace orvex {

// "GSM Neighbor Cell List": GSM neighbours seen from UTRAN. The list is built and never published: after
// the first packet the section stays empty.
class GSMNeighbhorMeasurements final : public Base {
public:
    GSMNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
