#pragma once

#include "CellMonitorList.h"
#include "LTE/LogCode_0xB0C1.h"
#include "LTE/LogCode_0xB0C2.h"
#include "PacketSection.h"

namespace orvex {

// "Serving Cell Info": who the serving LTE cell is, from the baseband and from the telephony service's
// cell-monitor list. Where both tell a row, whichever came last is shown.
class LTEServingCellInfo final : public PacketSection<LogCode_0xB0C2, LogCode_0xB0C1, CellMonitorList> {
public:
    LTEServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB0C2& cell) override;
    void update(const LogCode_0xB0C1& antennas) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
