#pragma once

#include "GSM/LogCode_0x7130.h"
#include "GSM/LogCode_0x7132.h"
#include "PacketSection.h"

namespace orvex {

// "Process PS": registration and mobility management of the packet-switched side.
class ProcessPS final : public PacketSection<LogCode_0x7130, LogCode_0x7132> {
public:
    ProcessPS(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7130& report) override;
    void update(const LogCode_0x7132& report) override;
};

} // namespace orvex
