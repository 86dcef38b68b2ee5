#pragma once

#include "LTE/LogCode_0xB179.h"
#include "PacketSection.h"

namespace orvex {

// "Measured Neighbor Cells": the intra-frequency neighbours measured in connected mode, one row dictionary
// each.
class MeasuredNeighborCells final : public PacketSection<LogCode_0xB179> {
public:
    MeasuredNeighborCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

} // namespace orvex
