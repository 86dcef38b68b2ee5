#pragma once

#include "LTE/LogCode_0xB17F.h"
#include "PacketSection.h"

namespace orvex {

// "Serving Cell Measurements": the serving cell as measured in idle mode, and its cell selection values.
class ServingCellMeasurement final : public PacketSection<LogCode_0xB17F> {
public:
    ServingCellMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB17F& report) override;
};

} // namespace orvex
