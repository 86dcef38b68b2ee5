#pragma once

#include "Base.h"

namespace orvex {

// "SIM Info": the SIM's elementary files (3GPP TS 31.102, clause 4.2), each shown as the telephony service
// forwards it.
class SimInfo final : public Base {
public:
    SimInfo(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
