#pragma once

#include "GSMTownReports.h"

namespace orvex::korat {

// The cells that the searcher finds on the serving frequency, and the active set among them: a cell joins it
// when it comes near the best one, and leaves it when it falls farther behind.
class WCDMASearcherReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;

private:
    void updateActiveSet(const GSMTownMoment& moment, const std::vector<WCDMALayer::Heard>& cells);
    bool isActive(const WCDMACell& cell) const;

    bool _isSearching = false;
    std::vector<const WCDMACell*> _activeSet;
};

} // namespace orvex::korat
