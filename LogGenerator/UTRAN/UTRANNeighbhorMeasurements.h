#pragma once

#include "PacketSection.h"
#include "UTRAN/LogCode_0xD00A.h"

namespace orvex {

// "Neighbor Cell List": the intra-frequency neighbours, one row dictionary each.
class UTRANNeighbhorMeasurements final : public PacketSection<LogCode_0xD00A> {
public:
    UTRANNeighbhorMeasurements(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD00A& report) override;
};

} // namespace orvex
