#include "modem/CellRecords.h"

#include "modem/LteBand.h"
#include "modem/ReportRows.h"

#include "TelephonyConstants.h"

#include <cmath>
#include <utility>

namespace orvex::korat {

namespace {
constexpr int kNotMeasured = 32767;
constexpr int kReceiveLevelZero = 111; // GSM counts from -111 dBm

constexpr struct {
    Radio radio;
    const char* key;
    Cell::Number Cell::*field;
} kNumbers[] = {
    {Radio::gsm, telephony::kCellLAC, &Cell::areaCode}, {Radio::gsm, telephony::kCellID, &Cell::identity},
    {Radio::gsm, telephony::kCellARFCN, &Cell::channel}, {Radio::umts, telephony::kCellLAC, &Cell::areaCode},
    {Radio::umts, telephony::kCellID, &Cell::identity}, {Radio::umts, telephony::kCellUARFCN, &Cell::channel},
    {Radio::umts, telephony::kCellScramblingCode, &Cell::physicalIdentity},
    {Radio::tdscdma, telephony::kCellLAC, &Cell::areaCode},
    {Radio::tdscdma, telephony::kCellID, &Cell::identity},
    {Radio::tdscdma, telephony::kCellUARFCN, &Cell::channel},
    {Radio::tdscdma, telephony::kCellScramblingCode, &Cell::physicalIdentity},
    {Radio::lte, telephony::kCellTAC, &Cell::areaCode}, {Radio::lte, telephony::kCellID, &Cell::identity},
    {Radio::lte, telephony::kCellPhysicalCellID, &Cell::physicalIdentity},
    {Radio::lte, telephony::kCellUARFCN, &Cell::channel}, // the key of its EARFCN too
};

const char* nameInRecords(Radio radio)
{
    switch (radio) {
    case Radio::gsm: return telephony::kRadioGSM;
    case Radio::umts: return telephony::kRadioUMTS;
    case Radio::tdscdma: return telephony::kRadioUTRAN;
    case Radio::lte: return telephony::kRadioLTE;
    default: return nullptr;
    }
}

void setLevel(Dictionary& record, const char* key, Cell::Level level)
{
    if (level)
        record.set(key, static_cast<std::int32_t>(std::lround(*level)));
}

DictionaryRef recordOf(const Cell& cell, const char* radioName)
{
    auto record = Dictionary::make({{telephony::kCellRadioAccessTechnology, radioName},
        {telephony::kCellType, cell.isServing ? telephony::kCellTypeServing : telephony::kCellTypeNeighbor}});
    if (const auto network = Network::of(cell.operatorId)) {
        record->set(telephony::kCellMCC, network->mcc);
        record->set(telephony::kCellMNC, network->mnc);
    }
    for (const auto& [radio, key, field] : kNumbers) {
        if (radio == cell.radio && cell.*field && std::in_range<std::int32_t>(*(cell.*field)))
            record->set(key, *(cell.*field));
    }
    if (cell.radio == Radio::gsm) { // in steps of 2 dB
        record->set(telephony::kCellRSSI,
            cell.receiveLevel ? (*cell.receiveLevel - kReceiveLevelZero) / 2 : std::int64_t{kNotMeasured});
    }
    if (const auto band = cell.radio == Radio::lte && cell.channel ? lteBandOf(*cell.channel) : std::nullopt)
        record->set(telephony::kCellBandInfo, *band);
    setLevel(*record, telephony::kCellRSCP, cell.rscp);
    setLevel(*record, telephony::kCellECN0, cell.ecio);
    return record;
}
} // namespace

ArrayRef cellRecords(const ModemState& state)
{
    auto result = Array::make();
    for (const Cell& cell : state.cells) {
        if (const char* name = nameInRecords(cell.radio))
            result->append(recordOf(cell, name));
    }
    return result;
}

DictionaryRef simFiles(const ModemState& state)
{
    ReportRows files;
    if (state.sim) {
        files.add(telephony::kSimFileICCID, state.sim->iccid);
        files.add(telephony::kSimFileMSISDN, state.sim->ownNumbers);
    }
    return files.dictionary();
}

ArrayRef packetDataContexts(const ModemState& state)
{
    auto result = Array::make();
    for (const Bearer& bearer : state.bearers)
        result->append(rowsOf(bearer).dictionary());
    return result;
}

} // namespace orvex::korat
