#pragma once

#include "Base.h"

namespace orvex {

// "Neighbor Cells List": the neighbours measured in idle mode, one row dictionary each.
class NeighborCellsList final : public Base {
public:
    NeighborCellsList(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
