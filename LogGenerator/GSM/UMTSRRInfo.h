#pragma once

#include "CellMonitorList.h"
#include "GSM/LogCode_0x4031.h"
#include "GSM/LogCode_0x4125.h"
#include "GSM/LogCode_0x4127.h"
#include "GSM/LogCode_0x4157.h"
#include "PacketSection.h"

namespace orvex {

// "UMTS RR Info": the WCDMA serving cell and what the radio resource layer does there, from the baseband and
// from the telephony service's cell-monitor list.
class UMTSRRInfo final
    : public PacketSection<LogCode_0x4125, LogCode_0x4031, LogCode_0x4127, LogCode_0x4157, CellMonitorList> {
public:
    UMTSRRInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4125& report) override;
    void update(const LogCode_0x4031& report) override;
    void update(const LogCode_0x4127& report) override;
    void update(const LogCode_0x4157& report) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
