#pragma once

#include "RadioField.h"
#include "Subscriber.h"

#include "packets/PLMN.h"

#include <vector>

// A town with a GSM network, the subscriber's own, and a UMTS network that he may use as a guest.
namespace orvex::korat::gsmTown {

inline constexpr double kRoadLength = 3000;  // m
inline constexpr double kMarketPlace = 1500; // m
inline constexpr RadioField::Underpass kUnderpass{2100, 2350};

struct Area {
    PLMN plmn;
    int locationAreaCode = 0;
    int routingAreaCode = 0;
};

inline constexpr Area kGSMArea{{subscriber::kMCC, subscriber::kMNC, 2}, 5120, 17};
inline constexpr Area kUMTSArea{{999, 100, 3}, 6215, 4};

// How weak a cell may be, in dBm, to be reported: a GSM carrier, and the RSCP of a UMTS cell.
inline constexpr double kWeakestGSM = -103;
inline constexpr double kWeakestRSCP = -112;
inline constexpr std::size_t kLargestList = 32;

// Where a network has its cells: wide ones along the road, small ones around the market place, and one in the
// underpass.
struct CellSites {
    int wide = 0;
    int small = 0;
    double marketRadius = 0;    // m
    double wideLevelAt20m = 0;  // dBm
    double smallLevelAt20m = 0; // dBm
    double nearest = 0;         // m from the road, of the wide ones
    double furtherBy = 0;       // m, from one to the next
    int distances = 1;          // after which they begin anew
};

// A transmitter for each cell, in this order.
std::vector<RadioField::Transmitter> transmittersAt(const CellSites& sites);

} // namespace orvex::korat::gsmTown
