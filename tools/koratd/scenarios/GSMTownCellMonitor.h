#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// The list of the cell monitor: the serving cell, and the neighbours of both networks.
class GSMTownCellMonitor final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;
};

} // namespace orvex::korat
