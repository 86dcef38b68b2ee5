#pragma once

#include "PacketSection.h"
#include "UTRAN/LogCode_0xD00C.h"

namespace orvex {

// "TRCH BLER": block error rates of the transport channels, one row dictionary each.
class TRCHBLERMeasurement final : public PacketSection<LogCode_0xD00C> {
public:
    TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00C& report) override;
};

} // namespace orvex
