#pragma once

#include "LTE/LogCode_0xB186.h"
#include "PacketSection.h"

namespace orvex {

// "Reselection Candidates": the serving cell from which reselection is considered.
class ReselectionCandidatesMisc final : public PacketSection<LogCode_0xB186> {
public:
    ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB186& report) override;
};

} // namespace orvex
