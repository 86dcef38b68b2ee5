#pragma once

#include "Base.h"

namespace orvex {

// "Connected mode LTE Intra-frequency Measurement": the serving cell as measured in connected mode.
class ConnectedModeMeasurementMisc final : public Base {
public:
    ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex
