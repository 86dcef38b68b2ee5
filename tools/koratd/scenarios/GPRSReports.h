#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// What GSM cells broadcast about packet data.
class GPRSReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;
};

} // namespace orvex::korat
