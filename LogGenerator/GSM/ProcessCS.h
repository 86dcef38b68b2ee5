#pragma once

#include "GSM/LogCode_0x7131.h"
#include "GSM/LogCode_0x7132.h"
#include "PacketSection.h"

namespace orvex {

// "Process CS": registration and mobility management of the circuit-switched side.
class ProcessCS final : public PacketSection<LogCode_0x7131, LogCode_0x7132> {
public:
    ProcessCS(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7131& report) override;
    void update(const LogCode_0x7132& report) override;
};

} // namespace orvex
