#pragma once

#include "Base.h"

namespace orvex {

// "Detected Cells": cells found in connected mode but not measured, one row dictionary each.
class DetectedCells final : public Base {
public:
    DetectedCells(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
