#pragma once

#include "LTE/LogCode_0xB186.h"
#include "PacketSection.h"

namespace orvex {

// "Reselection Candidates List": the cells of any radio technology considered for reselection, one row
// dictionary each.
class ReselectionCandidatesList final : public PacketSection<LogCode_0xB186> {
public:
    ReselectionCandidatesList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB186& report) override;
};

} // namespace orvex
