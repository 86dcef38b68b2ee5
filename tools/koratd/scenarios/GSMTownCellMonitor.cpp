#include "GSMTownCellMonitor.h"

#include "GSMTown.h"

#include "packets/ExtraPacket.h"

#include "Array.h"
#include "Dictionary.h"
#include "TelephonyConstants.h"

#include <cmath>

namespace orvex::korat {

namespace {
constexpr int kUnknown = 32767;
constexpr double kWeakestTold = -100; // dBm; a GSM carrier below is known, its strength is not

int rounded(double value)
{
    return static_cast<int>(std::lround(value));
}

DictionaryRef record(const char* technology, const char* type, const gsmTown::Area& area)
{
    return Dictionary::make({
        {telephony::kCellRadioAccessTechnology, technology},
        {telephony::kCellType, type},
        {telephony::kCellMCC, area.plmn.mcc},
        {telephony::kCellMNC, area.plmn.mnc},
        {telephony::kCellLAC, area.locationAreaCode},
    });
}

// The list tells GSM levels in steps of 2 dB.
DictionaryRef gsmRecord(const Heard<GSMCell>& heard, const char* type)
{
    auto result = record(telephony::kRadioGSM, type, gsmTown::kGSMArea);
    result->set(telephony::kCellID, heard.cell->cellID);
    result->set(telephony::kCellARFCN, heard.cell->arfcn);
    result->set(telephony::kCellRSSI, heard.level < kWeakestTold ? kUnknown : rounded(heard.level / 2));
    return result;
}

// Of a cell on another frequency it is only known that it is there.
DictionaryRef umtsRecord(const WCDMALayer::Heard& heard, const char* type, bool isMeasured)
{
    auto result = record(telephony::kRadioUMTS, type, gsmTown::kUMTSArea);
    result->set(telephony::kCellID, heard.cell->cellIdentity);
    result->set(telephony::kCellUARFCN, heard.cell->uarfcn);
    result->set(telephony::kCellScramblingCode, heard.cell->scramblingCode);
    result->set(telephony::kCellRSCP, isMeasured ? rounded(heard.rscp) : kUnknown);
    result->set(telephony::kCellECN0, isMeasured ? rounded(heard.ecNo) : kUnknown);
    return result;
}
} // namespace

std::span<const LogCode> GSMTownCellMonitor::codes() const
{
    static constexpr LogCode kCodes[] = {kCellMonitorCode};
    return kCodes;
}

void GSMTownCellMonitor::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    const bool isOnUMTS = moment.phase.isOnUMTS();
    const bool isNewCell = isOnUMTS ? moment.isNewWCDMACell : moment.isNewGSMCell;
    if ((!isOnUMTS && !moment.phase.isOnGSM()) || !(isNewCell || moment.isEvery(50)))
        return;
    const auto serving = moment.wcdma.serving();
    auto cells = Array::make();
    cells->append(isOnUMTS ? umtsRecord(serving, telephony::kCellTypeServing, true)
                           : gsmRecord(moment.gsm.serving(), telephony::kCellTypeServing));
    for (const auto& other : moment.gsm.others(gsmTown::kWeakestGSM)) {
        if (cells->size() <= gsmTown::kLargestList)
            cells->append(gsmRecord(other, telephony::kCellTypeNeighbor));
    }
    for (const auto& other : moment.wcdma.others(gsmTown::kWeakestRSCP)) {
        const bool isMeasured = other.cell->uarfcn == serving.cell->uarfcn;
        if (cells->size() <= 2 * gsmTown::kLargestList)
            cells->append(umtsRecord(other, telephony::kCellTypeNeighbor, isMeasured));
    }
    messages.push_back(cellMonitorMessage(moment.now, cells));
}

} // namespace orvex::korat
