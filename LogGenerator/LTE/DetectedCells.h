#pragma once

#include "LTE/LogCode_0xB179.h"
#include "PacketSection.h"

namespace orvex {

// "Detected Cells": cells found in connected mode but not measured, one row dictionary each.
class DetectedCells final : public PacketSection<LogCode_0xB179> {
public:
    DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

} // namespace orvex
