#pragma once

#include "CellMonitorList.h"
#include "GSM/LogCode_0x7132.h"
#include "GSM/LogCode_0x7135.h"
#include "PacketSection.h"

namespace orvex {

// "Serving PLMN": the network that serves the handset, from the baseband and from the telephony service's
// cell-monitor list. Where both tell a row, whichever came last is shown: network code 01 is "01 " from the
// baseband, digit by digit, and "1" from the list, a number.
class ServingPLMN final : public PacketSection<LogCode_0x7135, LogCode_0x7132, CellMonitorList> {
public:
    ServingPLMN(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7135& report) override;
    void update(const LogCode_0x7132& report) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
