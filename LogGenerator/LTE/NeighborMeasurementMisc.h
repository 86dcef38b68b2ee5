#pragma once

#include "Base.h"

namespace orvex {

// "Neighbor Measurements": what the idle-mode neighbour measurement says of its layer.
class NeighborMeasurementMisc final : public Base {
public:
    NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
