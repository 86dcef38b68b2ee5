#pragma once

#include "CellMonitorList.h"
#include "GSM/LogCode_0x4005.h"
#include "PacketSection.h"

namespace orvex {

// "UMTS Set": WCDMA neighbours, one row dictionary each, from the baseband's ranking or from the telephony
// service's cell-monitor list, whichever came last. The two name and scale their rows differently.
class UMTSSet final : public PacketSection<LogCode_0x4005, CellMonitorList> {
public:
    UMTSSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4005& report) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
