#pragma once

#include "Base.h"

namespace orvex {

// "Reselection Candidates List": the cells of any radio technology considered for reselection, one row
// dictionary each.
class ReselectionCandidatesList final : public Base {
public:
    ReselectionCandidatesList(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
