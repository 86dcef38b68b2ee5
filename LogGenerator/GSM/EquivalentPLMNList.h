#pragma once

#include "GSM/LogCode_0x7150.h"
#include "PacketSection.h"

namespace orvex {

// "Equivalent PLMN List": the networks that count as the serving one, one row dictionary each.
class EquivalentPLMNList final : public PacketSection<LogCode_0x7150> {
public:
    EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7150& report) override;
};

} // namespace orvex
