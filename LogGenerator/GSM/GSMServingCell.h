#pragma once

#include "CellMonitorList.h"
#include "GSM/LogCode_0x5076.h"
#include "GSM/LogCode_0x5134.h"
#include "GSM/LogCode_0x5137.h"
#include "PacketSection.h"

namespace orvex {

// "GSM Serving Cell": who the serving GSM cell is and how well it is heard, from the baseband and from the
// telephony service's cell-monitor list. Where both tell a row, whichever came last is shown.
class GSMServingCell final
    : public PacketSection<LogCode_0x5134, LogCode_0x5137, LogCode_0x5076, CellMonitorList> {
public:
    GSMServingCell(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x5134& report) override;
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x5076& report) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
