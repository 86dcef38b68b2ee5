#pragma once

#include "RadioField.h"
#include "Subscriber.h"

#include "packets/PLMN.h"

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

} // namespace orvex::korat::gsmTown
