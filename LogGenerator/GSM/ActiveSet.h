#pragma once

#include "GSM/LogCode_0x417A.h"
#include "PacketSection.h"

namespace orvex {

// "Active Set": the WCDMA cells that serve the handset at the same time, one row dictionary each.
class ActiveSet final : public PacketSection<LogCode_0x417A> {
public:
    ActiveSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x417A& report) override;
};

} // namespace orvex
