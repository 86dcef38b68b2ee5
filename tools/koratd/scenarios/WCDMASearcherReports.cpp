#include "WCDMASearcherReports.h"

#include "GSMTown.h"

#include "packets/WCDMASearcherPacket.h"

#include <algorithm>

namespace orvex::korat {

namespace {
constexpr double kJoins = 3; // dB below the best cell
constexpr double kLeaves = 5;
constexpr std::size_t kLargestActiveSet = 4;

// The cells on the serving frequency, the serving one first.
std::vector<WCDMALayer::Heard> foundCells(const WCDMALayer& layer)
{
    const auto serving = layer.serving();
    std::vector<WCDMALayer::Heard> result{serving};
    for (const auto& other : layer.others(gsmTown::kWeakestRSCP)) {
        if (other.cell->uarfcn == serving.cell->uarfcn && result.size() < gsmTown::kLargestList)
            result.push_back(other);
    }
    return result;
}

WCDMASearcherPacket::Cell foundCell(
    const WCDMALayer::Heard& heard, WCDMASearcherPacket::Set set, Randomness& randomness)
{
    WCDMASearcherPacket::Cell cell;
    cell.scramblingCode = heard.cell->scramblingCode;
    cell.set = set;
    // Mostly all three are there; what the first misses, one of the others has.
    const std::size_t first = randomness.chance(0.9) ? 0 : randomness.chance(0.5) ? 1 : 2;
    for (std::size_t i = first; i < cell.ecIo.size(); ++i)
        cell.ecIo[i] = std::min(heard.ecNo + 0.3 * randomness.normal(), 0.0);
    return cell;
}
} // namespace

std::span<const LogCode> WCDMASearcherReports::codes() const
{
    static constexpr LogCode kCodes[] = {WCDMASearcherPacket::kCode};
    return kCodes;
}

void WCDMASearcherReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    using Set = WCDMASearcherPacket::Set;
    const bool wasSearching = _isSearching;
    _isSearching = moment.phase.isOnUMTS();
    if (!_isSearching || !(moment.isEvery(5) || moment.isNewWCDMACell))
        return;
    WCDMASearcherPacket report;
    report.rssi = moment.wcdma.rssi();
    if (wasSearching) { // the first report comes before anything is found
        const auto cells = foundCells(moment.wcdma);
        updateActiveSet(moment, cells);
        for (const auto& heard : cells) {
            const Set set = isActive(*heard.cell) ? Set::active
                : heard.cell->isListed            ? Set::monitored
                                                  : Set::detected;
            report.cells.push_back(foundCell(heard, set, moment.randomness));
        }
    }
    messages.push_back(report.message(moment.now));
}

void WCDMASearcherReports::updateActiveSet(
    const GSMTownMoment& moment, const std::vector<WCDMALayer::Heard>& cells)
{
    // Only on a dedicated channel can several cells send the same.
    const bool isSoft = moment.phase.rrc == WCDMARRCStatePacket::State::cellDCH;
    const double best = std::ranges::max(cells, {}, &WCDMALayer::Heard::ecNo).ecNo;
    std::vector<const WCDMACell*> next;
    for (const auto& heard : cells) {
        const double window = isActive(*heard.cell) ? kLeaves : kJoins;
        const bool isServing = &heard == &cells.front();
        if (isServing || (isSoft && heard.ecNo > best - window && next.size() < kLargestActiveSet))
            next.push_back(heard.cell);
    }
    _activeSet = std::move(next);
}

bool WCDMASearcherReports::isActive(const WCDMACell& cell) const
{
    return std::ranges::find(_activeSet, &cell) != _activeSet.end();
}

} // namespace orvex::korat
