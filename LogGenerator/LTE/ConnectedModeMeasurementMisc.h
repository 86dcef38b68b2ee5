#pragma once

#include "LTE/LogCode_0xB179.h"
#include "PacketSection.h"

namespace orvex {

// "Connected mode LTE Intra-frequency Measurement": the serving cell as measured in connected mode.
class ConnectedModeMeasurementMisc final : public PacketSection<LogCode_0xB179> {
public:
    ConnectedModeMeasurementMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB179& report) override;
};

} // namespace orvex
