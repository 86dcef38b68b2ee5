#pragma once

#include "Base.h"

namespace orvex {

// "RRC Info": the UTRAN RRC state (3GPP TS 25.331, clause 7.1).
class RRC_State final : public Base {
public:
    RRC_State(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
