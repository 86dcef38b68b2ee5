#pragma once

#include "Base.h"

namespace orvex {

// "Serving Cell Measurements": the serving cell as measured in idle mode, and its cell selection values.
class ServingCellMeasurement final : public Base {
public:
    ServingCellMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
