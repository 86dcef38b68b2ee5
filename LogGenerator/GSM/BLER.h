#pragma once

#include "GSM/LogCode_0x4116.h"
#include "PacketSection.h"

namespace orvex {

// "BLER": block errors of the WCDMA transport channels.
class BLER final : public PacketSection<LogCode_0x4116> {
public:
    BLER(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4116& report) override;
};

} // namespace orvex
