#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// The radio side of UMTS but for the searcher: RRC state, serving cell, ciphering, power, ranked cells.
class WCDMARadioReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;
};

} // namespace orvex::korat
