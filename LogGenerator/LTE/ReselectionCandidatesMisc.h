#pragma once

#include "Base.h"

namespace orvex {

// "Reselection Candidates": the serving cell from which reselection is considered.
class ReselectionCandidatesMisc final : public Base {
public:
    ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
