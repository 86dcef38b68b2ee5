#pragma once

#include "LTE/LogCode_0xB180.h"
#include "PacketSection.h"

namespace orvex {

// "Neighbor Measurements": what the idle-mode neighbour measurement says of its layer.
class NeighborMeasurementMisc final : public PacketSection<LogCode_0xB180> {
public:
    NeighborMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB180& report) override;
};

} // namespace orvex
