#pragma once

#include "LTE/LogCode_0xB180.h"
#include "PacketSection.h"

namespace orvex {

// "Neighbor Cells List": the neighbours measured in idle mode, one row dictionary each.
class NeighborCellsList final : public PacketSection<LogCode_0xB180> {
public:
    NeighborCellsList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB180& report) override;
};

} // namespace orvex
