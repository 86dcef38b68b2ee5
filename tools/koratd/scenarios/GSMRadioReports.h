#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// The radio side of GSM: cells and what the handset measures of them, the channel of a call.
class GSMRadioReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;

private:
    int _reselectionSteps = 0; // until the handset is idle on its new cell
};

} // namespace orvex::korat
