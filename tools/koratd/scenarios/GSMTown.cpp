#include "GSMTown.h"

namespace orvex::korat::gsmTown {

std::vector<RadioField::Transmitter> transmittersAt(const CellSites& sites)
{
    std::vector<RadioField::Transmitter> result(static_cast<std::size_t>(sites.wide + sites.small + 1));
    for (int i = 0; i < static_cast<int>(result.size()); ++i) {
        RadioField::Transmitter& transmitter = result[static_cast<std::size_t>(i)];
        if (i < sites.wide) {
            transmitter.position = kRoadLength * i / (sites.wide - 1);
            transmitter.offset = sites.nearest + sites.furtherBy * (i % sites.distances);
            transmitter.levelAt20m = sites.wideLevelAt20m;
        } else if (i < sites.wide + sites.small) {
            transmitter.position = kMarketPlace - sites.marketRadius + 8 * (i - sites.wide);
            transmitter.offset = 60;
            transmitter.levelAt20m = sites.smallLevelAt20m;
            transmitter.slope = 45;
        } else {
            transmitter.position = (kUnderpass.from + kUnderpass.to) / 2;
            transmitter.isUnderground = true;
        }
    }
    return result;
}

} // namespace orvex::korat::gsmTown
