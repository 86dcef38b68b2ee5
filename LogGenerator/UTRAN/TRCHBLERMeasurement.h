#pragma once

#include "Base.h"

namespace orvex {

// "TRCH BLER": block error rates of the transport channels, one row dictionary each.
class TRCHBLERMeasurement final : public Base {
public:
    TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
