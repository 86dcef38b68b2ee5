#pragma once

#include "CellMonitorList.h"
#include "GSM/LogCode_0x5137.h"
#include "GSM/LogCode_0x51FF.h"
#include "PacketSection.h"

#include <map>

namespace orvex {

// "Neighboring Cells": the GSM neighbours, one row dictionary each, from the baseband or from the telephony
// service's cell-monitor list, whichever came last.
class NeighboringCells final : public PacketSection<LogCode_0x5137, LogCode_0x51FF, CellMonitorList> {
public:
    NeighboringCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x51FF& report) override;
    void update(const CellMonitorList& list) override;

private:
    std::map<int, int> _arfcnToBsic; // of the last 0x51FF; the neighbours themselves come without BSIC
};

} // namespace orvex
