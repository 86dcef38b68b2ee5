#pragma once

#include "Base.h"

namespace orvex {

// "Neighbor Cell List": the intra-frequency neighbours, one row dictionary each.
class UTRANNeighbhorMeasurements final : public Base {
public:
    UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
