#pragma once

#include "Base.h"

namespace orvex {

// "Measured Neighbor Cells": the intra-frequency neighbours measured in connected mode, one row dictionary
// each.
class MeasuredNeighborCells final : public Base {
public:
    MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
