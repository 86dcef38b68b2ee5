#include "WCDMARadioReports.h"

#include "GSMTown.h"

#include "packets/WCDMACipheringPacket.h"
#include "packets/WCDMARRCStatePacket.h"
#include "packets/WCDMARankingPacket.h"
#include "packets/WCDMAServingCellPacket.h"
#include "packets/WCDMATransmitPowerPacket.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr int kSecurityStep = 4;      // of a connection: when ciphering starts
constexpr int kGSMOffset = 6;         // dB that a GSM cell must be better to be ranked like a UMTS cell
constexpr double kWeakestPower = -50; // dBm
constexpr double kStrongestPower = 24;

int rounded(double value)
{
    return static_cast<int>(std::lround(value));
}

void reportServingCell(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    const WCDMACell& cell = *moment.wcdma.serving().cell;
    WCDMAServingCellPacket serving;
    serving.uplinkUARFCN = cell.uplinkUARFCN();
    serving.downlinkUARFCN = cell.uarfcn;
    serving.cellIdentity = cell.cellIdentity;
    serving.uraID = cell.uraID;
    messages.push_back(serving.message(moment.now));
}

void reportTransmitPower(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    WCDMATransmitPowerPacket report;
    // What the pilot lost on its way, the handset must send the more.
    const double needed = -82 - moment.wcdma.serving().rscp;
    const int count = moment.randomness.number(3, 8);
    report.powers.emplace_back(std::clamp(needed, kWeakestPower, kStrongestPower));
    for (int i = 1; i < count; ++i) {
        const double power = needed + 1.5 * moment.randomness.normal();
        if (moment.randomness.chance(0.15)) {
            report.powers.emplace_back();
        } else {
            report.powers.emplace_back(std::clamp(power, kWeakestPower, kStrongestPower));
        }
    }
    messages.push_back(report.message(moment.now));
}

WCDMARankingPacket rankedUMTSCells(const WCDMALayer& layer)
{
    WCDMARankingPacket report;
    for (const auto& other : layer.others(gsmTown::kWeakestRSCP)) {
        if (!other.cell->isListed || report.umtsNeighbors.size() >= gsmTown::kLargestList)
            continue;
        WCDMARankingPacket::UMTSNeighbor neighbor;
        neighbor.uarfcn = other.cell->uarfcn;
        neighbor.scramblingCode = other.cell->scramblingCode;
        neighbor.rscp = other.rscp;
        neighbor.rankingRSCP = other.averageRSCP;
        neighbor.ecNo = other.ecNo;
        neighbor.rank = rounded(other.averageRSCP);
        report.umtsNeighbors.push_back(neighbor);
    }
    return report;
}

WCDMARankingPacket rankedGSMCells(const GSMLayer& layer)
{
    WCDMARankingPacket report;
    for (const auto& other : layer.others(gsmTown::kWeakestGSM)) {
        if (report.gsmNeighbors.size() >= gsmTown::kLargestList)
            break;
        const int rank = rounded(other.level) - kGSMOffset;
        report.gsmNeighbors.push_back({other.cell->arfcn, other.cell->bsic(), other.level, rank});
    }
    return report;
}
} // namespace

std::span<const LogCode> WCDMARadioReports::codes() const
{
    static constexpr LogCode kCodes[] = {WCDMARRCStatePacket::kCode, WCDMAServingCellPacket::kCode,
        WCDMACipheringPacket::kCode, WCDMATransmitPowerPacket::kCode, WCDMARankingPacket::kCode};
    return kCodes;
}

void WCDMARadioReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    using State = WCDMARRCStatePacket::State;
    if (!moment.phase.isOnUMTS())
        return;
    const State state = *moment.phase.rrc;
    if (moment.isEvery(20))
        messages.push_back(WCDMARRCStatePacket{state}.message(moment.now));
    if (moment.isPhaseStart() && !moment.phase.hasConnection())
        messages.push_back(WCDMACipheringPacket{false}.message(moment.now));
    if (moment.stepInPhase == kSecurityStep && moment.phase.hasConnection())
        messages.push_back(WCDMACipheringPacket{true}.message(moment.now));
    if (moment.isNewWCDMACell || moment.isEvery(100))
        reportServingCell(moment, messages);
    if (moment.isEvery(5) && (moment.phase.hasConnection() || state == State::connecting))
        reportTransmitPower(moment, messages);
    // On a dedicated channel the network ranks the cells, not the handset. The packet has room for one list.
    if (moment.isEvery(5) && state != State::cellDCH && state != State::connecting) {
        const auto ranking = moment.isEvery(10) ? rankedUMTSCells(moment.wcdma) : rankedGSMCells(moment.gsm);
        messages.push_back(ranking.message(moment.now));
    }
}

} // namespace orvex::korat
