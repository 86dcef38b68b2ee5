#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// Registration: mobility management of both sides, and the network that the handset is in.
class MobilityReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;
};

} // namespace orvex::korat
