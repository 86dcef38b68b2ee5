#pragma once

#include "CellMonitorList.h"
#include "PacketSection.h"
#include "UTRAN/LogCode_0xD0E2.h"

namespace orvex {

// "Serving Cell Info": who the serving UTRAN cell is, from the baseband and from the telephony service's
// cell-monitor list. Where both tell a row, whichever came last is shown.
class UTRANServingCellInfo final : public PacketSection<LogCode_0xD0E2, CellMonitorList> {
public:
    UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD0E2& cell) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
