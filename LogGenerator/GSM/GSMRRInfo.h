#pragma once

#include "GSM/LogCode_0x5072.h"
#include "GSM/LogCode_0x512C.h"
#include "GSM/LogCode_0x5137.h"
#include "GSM/LogCode_0x51F6.h"
#include "PacketSection.h"

namespace orvex {

// "GSM RR Info": what the radio resource layer of GSM does.
class GSMRRInfo final : public PacketSection<LogCode_0x512C, LogCode_0x5137, LogCode_0x5072, LogCode_0x51F6> {
public:
    GSMRRInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x512C& report) override;
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x5072& report) override;
    void update(const LogCode_0x51F6& report) override;
};

} // namespace orvex
